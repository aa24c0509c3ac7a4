// SPDX-License-Identifier: Apache-2.0
// The views that the library brings compiled, for the modules to share.
#include "tests/shared/FieldTexts.h"

#include <EditorModel/effects/Views.h>
#include <EditorModel/library/ImportViews.h>
#include <EditorModel/library/PackViews.h>
#include <EditorModel/media/FileAnalyzer.h>
#include <EditorModel/media/ResourceTable.h>
#include <EditorModel/media/Views.h>
#include <EditorModel/services/Device.h>

#include <gtest/gtest.h>

#include <dlfcn.h>

#include <string>
#include <type_traits>
#include <typeinfo>

namespace {

/// An object with the typed views on top of its view.
template <class T, class... TypedViews>
struct Instance
{
    using Object = T;
    static_assert(Testing::isVirtualBase<PubSub::Object, T>);
    static_assert((std::is_base_of_v<Message::View<T>, TypedViews> && ...));
    // The view is out of reach under its own names, and no typed view begins with an object.
    static_assert((!std::is_convertible_v<TypedViews*, Message::View<T>*> && ...));
    static_assert((!std::is_constructible_v<TypedViews, const T*> && ...));
    static_assert((std::is_copy_constructible_v<TypedViews> && ...));
};

using Instances = testing::Types<
    Instance<Overlay::Preset, Preview::Details::ObjectViewBase<Overlay::Preset>>,
    Instance<Effect::Object, Preview::Details::ObjectViewBase<Effect::Object>>,
    Instance<Transition::Object, Preview::Details::ObjectViewBase<Transition::Object>>,
    Instance<Import::Object, Preview::Details::ObjectViewBase<Import::Object>>,
    Instance<Import::State, Import::Details::StateViewBase, Import::StateView>,
    Instance<Device::Output<Media::Audio>, Device::OutputViewBase<Media::Audio>,
             Device::View<Device::Output<Media::Audio>>>,
    Instance<Device::Output<Media::Video>, Device::OutputViewBase<Media::Video>,
             Device::View<Device::Output<Media::Video>>>,
    Instance<Media::File, Media::Details::FileViewBase, Media::View<Media::File>>,
    Instance<Media::Audio, Media::Details::AudioViewBase, Media::View<Media::Audio>,
             Media::Details::TAudioViewBase, Media::TView<Media::Audio>>,
    Instance<Media::Video, Media::Details::VideoViewBase, Media::View<Media::Video>,
             Media::Details::TVideoViewBase, Media::TView<Media::Video>>,
    Instance<FileAnalyzer::Object, FileAnalyzer::Details::ObjectViewBase, FileAnalyzer::View>,
    Instance<ResourceTable::Object, ResourceTable::Details::ObjectViewBase, ResourceTable::View>,
    Instance<Package::InApp::Object, Package::InApp::Details::ObjectViewBase, Package::InApp::View>,
    Instance<Package::InApp::Pack, Package::InApp::Details::PackViewBase, Package::InApp::PackView>>;

/// The library's own handle: symbols that only the tests have are not found through it.
class Library
{
public:
    Library() = default;
    ~Library()
    {
        if (m_handle)
            dlclose(m_handle);
    }
    Library(const Library&) = delete;
    Library& operator=(const Library&) = delete;

    bool isOpen() const { return m_handle != nullptr; }
    bool exports(const std::string& symbol) const { return dlsym(m_handle, symbol.c_str()) != nullptr; }

private:
    void* m_handle = dlopen(EDITORMODEL_LIBRARY_FILE, RTLD_NOW);
};

template <class Instance>
class ViewInstances : public testing::Test
{};
TYPED_TEST_SUITE(ViewInstances, Instances, );

TYPED_TEST(ViewInstances, AreExportedWhole)
{
    const Library library;
    ASSERT_TRUE(library.isOpen()) << dlerror();
    // "N7Message4ViewI...EE"; a member's name stands in front of the last letter.
    const std::string view = typeid(Message::View<typename TypeParam::Object>).name();
    ASSERT_EQ(view.rfind("N7Message4ViewI", 0), 0u);
    const auto member = [&](const std::string& mangled) {
        return "_Z" + view.substr(0, view.size() - 1) + mangled;
    };
    EXPECT_TRUE(library.exports("_ZTV" + view)) << "virtual functions";
    EXPECT_TRUE(library.exports("_ZTI" + view)) << "type information";
    EXPECT_TRUE(library.exports(member("C1Ev"))) << "constructor";
    EXPECT_TRUE(library.exports(member("D1Ev"))) << "destructor";
    // The library itself calls none of these.
    EXPECT_TRUE(library.exports(member("10observeAllEv")));
    EXPECT_TRUE(library.exports(member("12enumerateAllEv")));
    EXPECT_TRUE(library.exports(member("18processAddRequestsEv")));
    EXPECT_FALSE(library.exports(member("9unheardOfEv")));
}

} // namespace
