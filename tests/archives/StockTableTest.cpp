// SPDX-License-Identifier: Apache-2.0
// A map with tuples as keys is stored, byte for byte, as Boost's own templates store it.
#include "tests/archives/StockClasses.h"

#include <EditorModel/media/ResourceTable.h>

#include <gtest/gtest.h>

#include <sstream>

namespace StockTable {

struct Root
{
    virtual ~Root() = default;
};

struct FileInfo : virtual Root
{
    QString path;
    int track = 0;
    MTime duration;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        using boost::serialization::make_nvp;
        ar& make_nvp("path", path) & make_nvp("duration", duration) & make_nvp("track", track);
    }
};

struct Timing : virtual Root
{
    Stock::Shade mode = Stock::Light;
    MTime intro;
    MTime outro;
    int loopMinCount = 0;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        using boost::serialization::make_nvp;
        ar& make_nvp("mode", mode) & make_nvp("intro", intro) & make_nvp("outro", outro);
        ar& make_nvp("loopMinCount", loopMinCount);
    }
};

struct FileResourceInfo : virtual Root
{
    FileInfo info;
    Timing timing;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& boost::serialization::make_nvp("info", info) & boost::serialization::make_nvp("timing", timing);
    }
};

struct Table : virtual Root
{
    std::map<std::tuple<QString, Stock::Shade>, FileResourceInfo> resource2fileInfo;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& boost::serialization::make_nvp("resource2fileInfo", resource2fileInfo);
    }
};

} // namespace StockTable

// Exported classes are tracked, by value as well.
BOOST_CLASS_EXPORT(StockTable::FileInfo)
BOOST_CLASS_EXPORT(StockTable::Timing)
BOOST_CLASS_EXPORT(StockTable::FileResourceInfo)
BOOST_CLASS_EXPORT(StockTable::Table)

namespace {

template <class Table, class Type>
Table tableWith(int entries)
{
    Table table;
    for (int i = 0; i != entries; ++i) {
        auto& entry = table.resource2fileInfo[{QStringLiteral("resource <%1>").arg(i / 2), Type(i % 3)}];
        entry.info.path = QStringLiteral("/films/%1.mp4").arg(i);
        entry.info.track = i;
        entry.info.duration = MTime(1000 * i - 1);
        entry.timing.mode = static_cast<decltype(entry.timing.mode)>(i);
        entry.timing.intro = MTime((qint64(1) << 31) + i);
        entry.timing.outro = MTime(-i);
        entry.timing.loopMinCount = 7 * i;
    }
    return table;
}

template <class Archive, class T>
std::string saved(const T& table)
{
    std::ostringstream stream;
    {
        Archive archive(stream);
        archive << boost::serialization::make_nvp("table", table);
    }
    return stream.str();
}

template <class Archive>
void expectAlike(int entries)
{
    const auto ours = tableWith<ResourceTable::Object, Resource::Type>(entries);
    const auto stock = tableWith<StockTable::Table, Stock::Shade>(entries);
    EXPECT_EQ(ours.resource2fileInfo.size(), static_cast<std::size_t>(entries));
    EXPECT_EQ(saved<Archive>(ours), saved<Archive>(stock));
}

TEST(StockTable, TablesOfAnySizeAreStoredAlike)
{
    for (const int entries : {0, 1, 2, 7}) {
        expectAlike<boost::archive::binary_oarchive>(entries);
        expectAlike<boost::archive::xml_oarchive>(entries);
    }
}

template <class InArchive, class OutArchive>
void expectReadAlike()
{
    std::istringstream stream(saved<OutArchive>(tableWith<StockTable::Table, Stock::Shade>(7)));
    ResourceTable::Object table;
    InArchive archive(stream);
    archive >> boost::serialization::make_nvp("table", table);
    const std::string back = saved<OutArchive>(table);
    EXPECT_EQ(back, saved<OutArchive>(tableWith<StockTable::Table, Stock::Shade>(7)));
}

TEST(StockTable, WhatStockTemplatesStoredIsRead)
{
    expectReadAlike<boost::archive::binary_iarchive, boost::archive::binary_oarchive>();
    expectReadAlike<boost::archive::xml_iarchive, boost::archive::xml_oarchive>();
}

} // namespace
