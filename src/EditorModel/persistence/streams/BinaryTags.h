// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QtGlobal>

namespace Serialize::Details {

/// In place of a number: a name that has none yet follows.
constexpr quint64 newName = 0;
/// Names are numbered from here on, so that none can be taken for a tag.
constexpr quint64 firstName = 32;

/// What a value is, in one byte before it. Stored data: numbers are never given anew.
enum Tag : unsigned char
{
    NullTag = 1,
    ReferenceTag = 2,
    ObjectTag = 3,
    PartTag = 4,
    EndObjectTag = 5,
    PictureTag = 6,
    SequenceTag = 7,
    EndSequenceTag = 8,
    ItemTag = 9,
    EndItemTag = 10,
    FalseTag = 11,
    TrueTag = 12,
    Int32Tag = 13,
    UInt32Tag = 14,
    Int64Tag = 15,
    RealTag = 16,
    TimeTag = 17,
    TextTag = 18,
    PointTag = 19,
};

} // namespace Serialize::Details
