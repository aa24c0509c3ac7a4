// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QLatin1String>

#include <cstddef>

/// Tags, attributes and values of the XML form. Stored data.
namespace Serialize::Details::Xml {

/// A constant for every compiler: measuring the text at run time is not.
template <std::size_t Size>
constexpr QLatin1String text(const char (&literal)[Size])
{
    return QLatin1String(literal, static_cast<int>(Size) - 1);
}

inline constexpr QLatin1String root = text("EditorModel");
inline constexpr QLatin1String route = text("route");
inline constexpr QLatin1String stream = text("stream");
inline constexpr QLatin1String version = text("version");
constexpr int currentVersion = 1;

inline constexpr QLatin1String item = text("Item");
inline constexpr QLatin1String count = text("count");

inline constexpr QLatin1String className = text("class");
inline constexpr QLatin1String id = text("id");
inline constexpr QLatin1String reference = text("ref");
inline constexpr QLatin1String null = text("null");

inline constexpr QLatin1String x = text("x");
inline constexpr QLatin1String y = text("y");
inline constexpr QLatin1String yes = text("true");
inline constexpr QLatin1String no = text("false");
inline constexpr QLatin1String encoding = text("encoding");
inline constexpr QLatin1String base64 = text("base64");

} // namespace Serialize::Details::Xml
