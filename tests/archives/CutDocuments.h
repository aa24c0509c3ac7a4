// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/shared/DocumentForms.h"

#include <QByteArray>

/// The document with an early end, after `part` of it, that a reader notices only when it comes there:
/// checksums and what closes the document are in order.
QByteArray cutWithin(const QByteArray& document, double part, const Way& way);

/// The document with its checksums made anew, as those of a cut one are: itself.
QByteArray closedAgain(const QByteArray& document, const Way& way);
