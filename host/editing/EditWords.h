// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditSession.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace Host {

// What single words of a command mean. Where nothing else is said they throw Refusal for a word that can't
// mean it.

QString quoted(const QString& word);
/// Why a command can't be understood; the command names it.
[[noreturn]] void reject(const QString& why);
MTime timeAt(const QString& word);
/// By its number, from 1 on; null for what is no number of anything.
template <class T>
const T* numbered(const std::vector<const T*>& objects, const QString& word)
{
    bool isNumber = false;
    const uint number = word.toUInt(&isNumber);
    return isNumber && number >= 1 && number <= objects.size() ? objects[number - 1] : nullptr;
}

/// A clip on the timeline, by its number among these, or by a name that no other one of them has.
const Timeline::Clip* clipOf(const Timeline::Object& timeline,
                             const std::vector<const Timeline::Clip*>& clips, const QString& word);
/// A speed.
double factorAt(const QString& word);
double numberAt(const QString& word);
/// A volume: whole percents from 0 on.
int percentAt(const QString& word);
int levelAt(const QString& word);
TrackType roleAt(const QString& word);
/// The last word of a command may ask the later clips to follow; there may be none at the index.
Ripple rippleAt(const QStringList& words, int index);

} // namespace Host
