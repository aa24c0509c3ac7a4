// SPDX-License-Identifier: Apache-2.0
// Persistent classes of a module that is loaded at run time.
#include "tests/shared/DocumentForms.h"
#include "tests/shared/FieldVisitors.h"

#include <gtest/gtest.h>

#include <dlfcn.h>

#include <memory>

namespace {

TEST(Plugin, BringsClassesThatStayWhenItIsClosed)
{
    void* const module = dlopen(EDITORMODEL_TEST_PLUGIN, RTLD_NOW | RTLD_LOCAL);
    ASSERT_TRUE(module) << dlerror();
    const auto makeThing = reinterpret_cast<Serialize::ISerializable* (*)()>(dlsym(module, "makeThing"));
    ASSERT_TRUE(makeThing);
    const std::unique_ptr<Serialize::ISerializable> thing(makeThing());
    const std::string dump = Testing::Dump::of(*thing);
    EXPECT_NE(dump.find("size: 7"), std::string::npos);

    dlclose(module);
    for (const Way& way : allWays) {
        const auto graph = graphOf(documentOf({thing.get()}, way));
        ASSERT_EQ(graph.roots().size(), 1u) << way.name;
        EXPECT_EQ(Testing::Dump::of(*graph.roots().front()), dump) << way.name;
    }
}

} // namespace
