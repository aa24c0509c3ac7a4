// SPDX-License-Identifier: Apache-2.0
#include <QSize>

// Loads Qt Core and Gui, and ends.
int main()
{
    return QSize(1, 0).isEmpty() ? 0 : 1;
}
