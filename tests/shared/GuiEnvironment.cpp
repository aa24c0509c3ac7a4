// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <QGuiApplication>

#include <memory>

namespace {

/// Pictures need an application object as long as any of them exists.
class GuiEnvironment final : public ::testing::Environment
{
    void SetUp() override { m_application = std::make_unique<QGuiApplication>(m_count, m_arguments); }
    void TearDown() override { m_application.reset(); }

    char m_name[6] = "tests";
    char* m_arguments[2] = {m_name, nullptr};
    int m_count = 1;
    std::unique_ptr<QGuiApplication> m_application;
};

[[maybe_unused]] const auto* const environment = ::testing::AddGlobalTestEnvironment(new GuiEnvironment);

} // namespace
