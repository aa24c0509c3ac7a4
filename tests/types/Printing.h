// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/types/Decibel.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Range.h>

#include <ostream>

// How the values look in the messages of failed tests. Both test libraries look for operators.

inline std::ostream& operator<<(std::ostream& out, MTime time)
{
    return out << time.ms() << " ms";
}

inline std::ostream& operator<<(std::ostream& out, Decibel level)
{
    return out << level.level() << " dB";
}

namespace Types {

inline std::ostream& operator<<(std::ostream& out, const Range& range)
{
    return out << "[" << range.from.ms() << ", " << range.to.ms() << ")";
}

} // namespace Types
