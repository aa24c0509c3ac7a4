// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <QByteArray>
#include <QString>

#include <functional>
#include <stdexcept>
#include <vector>

namespace Host {

/// Why a file cannot be replaced: completes "The file ...". What stood under its name stands there still,
/// unless the reason says otherwise.
class ReplacementFailed : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/// Gives a file new content, the parts one after another, and keeps the old file under its name with an
/// ending behind it, in place of what was kept so before. The ending is asked for when no other process saves
/// the file, and only where there is an old one. Whenever the process or the machine stops, the name stands
/// for the old content or the new one, whole, and so does that of the old file.
///
/// The content is on the disk when this returns. The permissions of the old file are kept, and its owner
/// where the process may give it away. A link is followed and stays. One process at a time saves a file; what
/// one that was killed has left is removed. Throws ReplacementFailed.
void replaceFile(const QString& path, const std::vector<QByteArray>& parts,
                 const std::function<QString()>& ending);

/// Tells the versions of a file apart: after a replacement, or another change, there is another one. Empty
/// where there is no file.
QByteArray versionOf(const QString& path);

/// A name beside the file that links lead to: its own with the ending. So replaceFile() names the old file.
/// Throws ReplacementFailed for links that lead in a circle.
QString siblingOf(const QString& path, const QString& ending);

} // namespace Host
