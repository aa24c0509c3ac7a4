// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/timeline/Clip.h>
#include <EditorModel/timeline/ClipOrder.h>
#include <EditorModel/timeline/ClipTiming.h>
#include <EditorModel/timeline/Label.h>
#include <EditorModel/timeline/Link.h>
#include <EditorModel/timeline/Object.h>
#include <EditorModel/timeline/Track.h>
#include <EditorModel/timeline/TrackingLink.h>
#include <EditorModel/timeline/TransitionType.h>
