// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/analysis/OverlayLinkInfo.h>
#include <EditorModel/analysis/TrackingData.h>
#include <EditorModel/analysis/TrackingHelper.h>
#include <EditorModel/analysis/TrackingTask.h>
