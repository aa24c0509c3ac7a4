// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/Pack.h>
#include <EditorModel/library/PackCatalogue.h>
#include <EditorModel/library/PackViews.h>
