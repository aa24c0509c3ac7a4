// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/media/ResourceHooks.h>
#include <EditorModel/media/ResourceInfo.h>
#include <EditorModel/media/ResourceRef.h>
