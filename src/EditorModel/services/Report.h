// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>

#include <QString>

namespace Report {

/// What a progress dialog shows. Setters store what they are given.
class EDITORMODEL_EXPORT Progress : public virtual PubSub::Object
{
public:
    /// Counts of the same unit, whatever the work counts in: `passed` of `total` are done.
    Progress* setTotal(int value);
    Progress* setPassed(int value);
    Progress* setLabel(const QString& value);
    Progress* setTitle(const QString& value);
    Progress* setCancelButtonText(const QString& value);
    /// Sets or clears the wish to cancel; the work itself looks at it.
    Progress* cancel(bool value);
    /// A hint for whoever shows the dialog, that it is the only modal one; the model gives it no meaning.
    Progress* setUniqueModal(bool value);

    int total = 0;
    int passed = 0;
    QString label;
    QString title;
    QString cancelButtonText;
    bool cancelled = false;
    bool uniqueModal = true;
};

} // namespace Report
