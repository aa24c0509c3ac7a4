// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QByteArray>
#include <QCryptographicHash>
#include <QtEndian>

namespace Fuzzing {

/// Signature, version and route, length, SHA-256.
constexpr int binaryFrameSize = 8 + 2 + 8 + 32;

/// A binary document of the field stream with this content. A fuzzer would never hit upon the checksum.
inline QByteArray framedStream(const QByteArray& content)
{
    char length[8];
    qToLittleEndian(quint64(content.size()), length);
    return QByteArray::fromHex("8945444d0d0a1a0a0101") + QByteArray(length, sizeof length) +
           QCryptographicHash::hash(content, QCryptographicHash::Sha256) + content;
}

} // namespace Fuzzing
