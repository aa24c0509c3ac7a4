// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "host/commands/Console.h"
#include "host/curves/Curve.h"

#include <QString>

namespace Host {

enum CurveSample : int
{
    NoSample,
    VolumeSample,
    TransformationSample,
};

struct CurveOptions
{
    QString document;
    /// Binary and XML archives are read too; they must be of one's own making.
    bool isOwn = false;
    /// Where the picture goes; empty for nowhere. The ending tells the form.
    QString picturePath;
    CurveSpan span;
    /// How many steps of time the table has.
    int steps = 10;
    /// An envelope that is written to the document first.
    CurveSample sample = NoSample;
};

/// Prints the first volume or transformation envelope of a document as its evaluation functions give it, and
/// draws it if that is wanted, for which there must be a QGuiApplication. What fails has one line on the
/// error output.
ExitCode curve(const CurveOptions& options);

} // namespace Host
