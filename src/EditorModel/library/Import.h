// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/ImportState.h>
#include <EditorModel/library/ImportViews.h>
