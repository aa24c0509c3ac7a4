// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Report.h>

namespace Report {

Progress* Progress::setTotal(int value)
{
    total = value;
    return this;
}

Progress* Progress::setPassed(int value)
{
    passed = value;
    return this;
}

Progress* Progress::setLabel(const QString& value)
{
    label = value;
    return this;
}

Progress* Progress::setTitle(const QString& value)
{
    title = value;
    return this;
}

Progress* Progress::setCancelButtonText(const QString& value)
{
    cancelButtonText = value;
    return this;
}

Progress* Progress::cancel(bool value)
{
    cancelled = value;
    return this;
}

Progress* Progress::setUniqueModal(bool value)
{
    uniqueModal = value;
    return this;
}

} // namespace Report
