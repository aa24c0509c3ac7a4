// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QString>

/// Tags, attributes and values of the XML form. Stored data.
namespace Serialize::Details::Xml {

inline const QString root = QStringLiteral("EditorModel");
inline const QString route = QStringLiteral("route");
inline const QString stream = QStringLiteral("stream");
inline const QString version = QStringLiteral("version");
constexpr int currentVersion = 1;

inline const QString item = QStringLiteral("Item");
inline const QString count = QStringLiteral("count");

inline const QString className = QStringLiteral("class");
inline const QString id = QStringLiteral("id");
inline const QString reference = QStringLiteral("ref");
inline const QString null = QStringLiteral("null");

inline const QString x = QStringLiteral("x");
inline const QString y = QStringLiteral("y");
inline const QString yes = QStringLiteral("true");
inline const QString no = QStringLiteral("false");
inline const QString encoding = QStringLiteral("encoding");
inline const QString base64 = QStringLiteral("base64");

} // namespace Serialize::Details::Xml
