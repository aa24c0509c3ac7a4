// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/types/MTime.h>

#include <QString>

#include <optional>
#include <string>

namespace Host {

/// A time as people type it, to the millisecond: "1:02:03.5" or "02:03.500" with 60 minutes to the hour and
/// 60 seconds to the minute, "90.25" or "90.25s" in seconds, "90250ms". A sign may stand before it. None for
/// anything else, and for more than a hundred thousand hours.
std::optional<MTime> timeOfText(const QString& text);

/// A span for people to read: "4.004 s", "1:02.5", "2:00:03".
std::string spanText(MTime span);

/// A time on a ruler, as short as the others on it allow: with hours if there are any up to `longest`, and
/// with the decimals that multiples of `step` have: "0:05", "1:02:30", "0:00.25".
std::string tickText(MTime time, MTime step, MTime longest);

} // namespace Host
