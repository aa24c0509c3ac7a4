// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/editing/EditSession.h"

#include <QString>
#include <QStringList>

namespace Host {

// What single words of a command mean. All but the first throw Refusal for a word that can't mean it.

QString quoted(const QString& word);
/// Why a command can't be understood; the command names it.
[[noreturn]] void reject(const QString& why);
MTime timeAt(const QString& word);
/// A speed.
double factorAt(const QString& word);
double numberAt(const QString& word);
int levelAt(const QString& word);
TrackType roleAt(const QString& word);
/// The last word of a command may ask the later clips to follow; there may be none at the index.
Ripple rippleAt(const QStringList& words, int index);

} // namespace Host
