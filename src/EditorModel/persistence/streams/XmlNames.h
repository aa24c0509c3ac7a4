// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QLatin1String>

/// Tags, attributes and values of the XML form. Stored data.
namespace Serialize::Details::Xml {

inline constexpr QLatin1String root("EditorModel");
inline constexpr QLatin1String route("route");
inline constexpr QLatin1String stream("stream");
inline constexpr QLatin1String version("version");
constexpr int currentVersion = 1;

inline constexpr QLatin1String item("Item");
inline constexpr QLatin1String count("count");

inline constexpr QLatin1String className("class");
inline constexpr QLatin1String id("id");
inline constexpr QLatin1String reference("ref");
inline constexpr QLatin1String null("null");

inline constexpr QLatin1String x("x");
inline constexpr QLatin1String y("y");
inline constexpr QLatin1String yes("true");
inline constexpr QLatin1String no("false");
inline constexpr QLatin1String encoding("encoding");
inline constexpr QLatin1String base64("base64");

} // namespace Serialize::Details::Xml
