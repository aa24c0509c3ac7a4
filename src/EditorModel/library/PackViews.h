// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/TypedView.h>
#include <EditorModel/library/Pack.h>
#include <EditorModel/library/PackCatalogue.h>

extern template class EDITORMODEL_EXPORT Message::View<Package::InApp::Object>;
extern template class EDITORMODEL_EXPORT Message::View<Package::InApp::Pack>;

namespace Package::InApp {

namespace Details {

class EDITORMODEL_EXPORT ObjectViewBase : private ::Message::View<Package::InApp::Object>
{
    EDITORMODEL_TYPED_VIEW(Package::InApp::Object, packInApp)
};

class EDITORMODEL_EXPORT PackViewBase : private ::Message::View<Package::InApp::Pack>
{
    EDITORMODEL_TYPED_VIEW(Package::InApp::Pack, pack)
};

} // namespace Details

/// Keeps or watches the catalogue.
class EDITORMODEL_EXPORT View : public Details::ObjectViewBase
{
protected:
    using Details::ObjectViewBase::packInAppChanged;
    /// Makes the call below; a replacement that wants it goes on to this one.
    void packInAppChanged(const Package::InApp::Object* object, const Package::InApp::Object* before,
                          const Package::InApp::Object* after) override;

    /// Called where `updateStatus` differs, with the new value, in front of packInAppChanged(object); also on
    /// arrival and departure, which compare with an empty catalogue.
    virtual void updateStatusChanged(const Package::InApp::Object* object);
};

/// Keeps or watches single packs.
class EDITORMODEL_EXPORT PackView : public Details::PackViewBase
{
protected:
    using Details::PackViewBase::packChanged;
    void packChanged(const Pack* pack, const Pack* before, const Pack* after) override;
};

} // namespace Package::InApp
