// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/PackViews.h>

template class Message::View<Package::InApp::Object>;
template class Message::View<Package::InApp::Pack>;

namespace Package::InApp {

void View::packInAppChanged(const Package::InApp::Object*, const Package::InApp::Object* before,
                            const Package::InApp::Object* after)
{
    if (before->updateStatus != after->updateStatus)
        updateStatusChanged(after);
}

void View::updateStatusChanged(const Package::InApp::Object*) {}

void PackView::packChanged(const Pack*, const Pack*, const Pack*) {}

} // namespace Package::InApp
