// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/timeline/Track.h>

// Loads the library, and Qt Core and Gui with it, and ends.
int main()
{
    return Timeline::Track().used ? 0 : 1;
}
