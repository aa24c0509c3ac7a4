// SPDX-License-Identifier: Apache-2.0
#pragma once

// Everything but <EditorModel/persistence/Json.h> and <EditorModel/persistence/ObjectTracker.h>, which bring the
// headers of the archives' libraries along.

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/library/EditorCollection.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/persistence/Serializable.h>
#include <EditorModel/persistence/Serializer.h>
#include <EditorModel/persistence/Type.h>
#include <EditorModel/services/AppEvents.h>
#include <EditorModel/services/Command.h>
#include <EditorModel/services/Statistics.h>
#include <EditorModel/services/Tutorial.h>
#include <EditorModel/types/AvTime.h>
#include <EditorModel/types/Decibel.h>
#include <EditorModel/types/FuzzyCompare.h>
#include <EditorModel/types/Image.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Norvel.h>
#include <EditorModel/types/Pen.h>
#include <EditorModel/types/Range.h>
#include <EditorModel/types/Rect.h>
#include <EditorModel/types/Transform.h>
#include <EditorModel/types/UniqueId.h>
