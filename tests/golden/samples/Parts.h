// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "Sample.h"

#include <EditorModel/analysis/MotionTracking.h>
#include <EditorModel/effects/Envelope.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/Indication.h>
#include <EditorModel/library/PackageContent.h>
#include <EditorModel/library/PackageStorage.h>
#include <EditorModel/media/ResourceTable.h>

namespace GoldenTests {

// What stands in several documents, each with a value of its own in every field.

ResourceTable::FileResourceInfo rainInfo();
MotionTracking::TimedFrame timedFrame();
MotionTracking::Data tracking();

Quiz::Question evenNumbers();
/// An envelope with nothing but an opacity.
TransformationEnvelope opacityEnvelope(int percent);

void fillSong(Import::Object& song);
Indication::Object marks();
Package::Object package();
Package::Storage storage();

} // namespace GoldenTests
