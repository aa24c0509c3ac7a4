// SPDX-License-Identifier: Apache-2.0
// Ten thousand records with pointers, saved and loaded: through the library's field lists, beside the same
// records with Boost.Serialization's templates, and with a tree of nlohmann json, used by hand.
#include "ArchiveRuns.h"
#include "Ratio.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/types/MTime.h>

#include <boost/serialization/deque.hpp>
#include <boost/serialization/export.hpp>
#include <boost/serialization/string.hpp>

#include <benchmark/benchmark.h>

#include <unordered_map>

namespace Listed {

/// A record as the model has them: values, a text, a time, and pointers into the rest of the document.
struct Record : Serialize::ISerializable, virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Record)

    int index = 0;
    bool enabled = false;
    double gain = 0.0;
    QString name;
    MTime start;
    MTime duration;
    const Record* master = nullptr;
    const Record* next = nullptr;
};

struct Content : Serialize::ISerializable, virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Content)

    std::deque<const Record*> records;
};

void fields(Serialize::Fields& f, Record& record)
{
    f("index", record.index)("enabled", record.enabled)("gain", record.gain)("name", record.name);
    f("start", record.start)("duration", record.duration)("master", record.master)("next", record.next);
}

void fields(Serialize::Fields& f, Content& content)
{
    f("records", content.records);
}

void freeGraph(const Content* content)
{
    for (const Record* const record : content->records)
        delete record;
    delete content;
}

} // namespace Listed

EDITORMODEL_ARCHIVE_NAME(Listed::Record, "Bench::Record")
EDITORMODEL_ARCHIVE_NAME(Listed::Content, "Bench::Content")
EDITORMODEL_PERSISTENT_CLASS(Listed::Record)
EDITORMODEL_PERSISTENT_CLASS(Listed::Content)

namespace ByHand {

/// The bases that the model's records have, so that both kinds of object cost the same to make and free.
struct Root
{
    virtual ~Root() = default;
};

struct Record : Root, virtual PubSub::Object
{
    int index = 0;
    bool enabled = false;
    double gain = 0.0;
    QString name;
    MTime start;
    MTime duration;
    const Record* master = nullptr;
    const Record* next = nullptr;

    template <class Archive>
    void serialize(Archive& archive, const unsigned int)
    {
        using boost::serialization::make_nvp;
        archive& make_nvp("index", index);
        archive& make_nvp("enabled", enabled);
        archive& make_nvp("gain", gain);
        std::string utf8 = name.toStdString();
        archive& make_nvp("name", utf8);
        if (Archive::is_loading::value)
            name = QString::fromStdString(utf8);
        time(archive, "start", start);
        time(archive, "duration", duration);
        archive& make_nvp("master", master);
        archive& make_nvp("next", next);
    }

    template <class Archive>
    static void time(Archive& archive, const char* key, MTime& value)
    {
        int ms = static_cast<int>(value.ms());
        archive& boost::serialization::make_nvp(key, ms);
        value = MTime(ms);
    }
};

struct Content : Root, virtual PubSub::Object
{
    std::deque<const Record*> records;

    template <class Archive>
    void serialize(Archive& archive, const unsigned int)
    {
        archive& boost::serialization::make_nvp("records", records);
    }
};

void freeGraph(const Content* content)
{
    for (const Record* const record : content->records)
        delete record;
    delete content;
}

} // namespace ByHand

BOOST_CLASS_EXPORT_GUID(ByHand::Record, "Hand_::Record")
BOOST_CLASS_EXPORT_GUID(ByHand::Content, "Hand_::Content")

namespace {

using namespace ArchiveRuns;

constexpr int recordCount = 10000;

/// Each record points at one behind it and one before it: nothing nests deeper than a few levels.
template <class Record, class Content>
struct Records
{
    std::deque<Record> all;
    Content content;

    Records() : all(recordCount)
    {
        for (int i = 0; i < recordCount; ++i) {
            Record& record = all[i];
            record.index = i;
            record.enabled = i % 3 == 0;
            record.gain = 0.25 * i + 0.1;
            record.name = QStringLiteral("clip number %1").arg(i);
            record.start = MTime(40 * i);
            record.duration = MTime(1000 + i);
            record.master = i > 0 ? &all[i / 2] : nullptr;
            record.next = i % 4 == 0 && i + 1 < recordCount ? &all[i + 1] : nullptr;
            content.records.push_back(&record);
        }
    }
};

using ListedRecords = Records<Listed::Record, Listed::Content>;
using HandRecords = Records<ByHand::Record, ByHand::Content>;

/// The tree that the Json archive makes, written down by hand.
json treeByHand(const ByHand::Content& content)
{
    std::unordered_map<const ByHand::Record*, int> ids;
    int lastId = 1;
    struct Writer
    {
        std::unordered_map<const ByHand::Record*, int>& ids;
        int& lastId;

        json operator()(const ByHand::Record* record) const
        {
            if (!record)
                return nullptr;
            json node = json::object();
            const auto entered = ids.try_emplace(record, lastId + 1);
            json& meta = node["$meta"];
            meta["class"] = "Bench::Record";
            if (!entered.second) {
                meta["ref"] = entered.first->second;
                return node;
            }
            meta["id"] = entered.first->second;
            ++lastId;
            node["index"] = record->index;
            node["enabled"] = record->enabled;
            node["gain"] = record->gain;
            node["name"] = record->name.toStdString();
            node["start"] = static_cast<int>(record->start.ms());
            node["duration"] = static_cast<int>(record->duration.ms());
            node["master"] = (*this)(record->master);
            node["next"] = (*this)(record->next);
            return node;
        }
    };
    const Writer write{ids, lastId};
    json root;
    json& node = root["content"];
    node["$meta"]["class"] = "Bench::Content";
    node["$meta"]["id"] = 1;
    json& records = node["records"];
    records["count"] = content.records.size();
    records["item_version"] = 0;
    json& items = records["item"];
    for (const auto* const record : content.records)
        items.push_back(write(record));
    return root;
}

ByHand::Content* readByHand(const json& root)
{
    std::unordered_map<int, ByHand::Record*> known;
    struct Reader
    {
        std::unordered_map<int, ByHand::Record*>& known;

        ByHand::Record* operator()(const json& node) const
        {
            if (node.is_null())
                return nullptr;
            const json& meta = node.at("$meta");
            const auto reference = meta.find("ref");
            if (reference != meta.end())
                return known.at(reference->get<int>());
            const int id = meta.at("id").get<int>();
            auto* const record = new ByHand::Record;
            known.emplace(id, record);
            record->index = node.at("index").get<int>();
            record->enabled = node.at("enabled").get<bool>();
            record->gain = node.at("gain").get<double>();
            record->name = QString::fromStdString(node.at("name").get_ref<const std::string&>());
            record->start = MTime(node.at("start").get<int>());
            record->duration = MTime(node.at("duration").get<int>());
            record->master = (*this)(node.at("master"));
            record->next = (*this)(node.at("next"));
            return record;
        }
    };
    const Reader read{known};
    auto* const content = new ByHand::Content;
    for (const json& item : root.at("content").at("records").at("item"))
        content->records.push_back(read(item));
    return content;
}

const ListedRecords& listed()
{
    static const ListedRecords records;
    return records;
}

const HandRecords& byHand()
{
    static const HandRecords records;
    return records;
}

void JsonSave(benchmark::State& state)
{
    if (storedAsJson(listed().content) != treeByHand(byHand().content).dump())
        state.SkipWithError("the tree written by hand is not the archive's");
    runSave(state, [] { return storedAsJson(listed().content); });
}
void JsonSaveByHand(benchmark::State& state)
{
    runSave(state, [] { return treeByHand(byHand().content).dump(); });
}
void JsonLoad(benchmark::State& state)
{
    runLoad(state, storedAsJson(listed().content), &loadedFromJson<Listed::Content>);
}
void JsonLoadByHand(benchmark::State& state)
{
    runLoad(state, storedAsJson(listed().content),
            [](const std::string& text) { return readByHand(json::parse(text)); });
}

void BinarySave(benchmark::State& state)
{
    runSave(state, [] { return stored<binary_oarchive>(listed().content); });
}
void BinarySaveByHand(benchmark::State& state)
{
    runSave(state, [] { return stored<binary_oarchive>(byHand().content); });
}
void BinaryLoad(benchmark::State& state)
{
    runLoad(state, stored<binary_oarchive>(listed().content), &loaded<binary_iarchive, Listed::Content>);
}
void BinaryLoadByHand(benchmark::State& state)
{
    runLoad(state, stored<binary_oarchive>(byHand().content), &loaded<binary_iarchive, ByHand::Content>);
}
void XmlSave(benchmark::State& state)
{
    runSave(state, [] { return stored<xml_oarchive>(listed().content); });
}
void XmlSaveByHand(benchmark::State& state)
{
    runSave(state, [] { return stored<xml_oarchive>(byHand().content); });
}
void XmlLoad(benchmark::State& state)
{
    runLoad(state, stored<xml_oarchive>(listed().content), &loaded<xml_iarchive, Listed::Content>);
}
void XmlLoadByHand(benchmark::State& state)
{
    runLoad(state, stored<xml_oarchive>(byHand().content), &loaded<xml_iarchive, ByHand::Content>);
}

void documentSave(benchmark::State& state, Document::Form form, Document::Route route)
{
    runDocumentSave(state, listed().content, recordCount, form, route);
}

void documentLoad(benchmark::State& state, Document::Form form, Document::Route route)
{
    runDocumentLoad(state, listed().content, form, route);
}

BENCHMARK(BinarySave);
BENCHMARK(BinarySaveByHand);
BENCHMARK(BinaryLoad);
BENCHMARK(BinaryLoadByHand);
BENCHMARK(XmlSave);
BENCHMARK(XmlSaveByHand);
BENCHMARK(XmlLoad);
BENCHMARK(XmlLoadByHand);
BENCHMARK(JsonSave);
BENCHMARK(JsonSaveByHand);
BENCHMARK(JsonLoad);
BENCHMARK(JsonLoadByHand);

#define DOCUMENT_BENCHMARKS(Form, Route)                                                                     \
    BENCHMARK_CAPTURE(documentSave, Form##Route, Document::Form, Document::Route);                           \
    BENCHMARK_CAPTURE(documentLoad, Form##Route, Document::Form, Document::Route)

DOCUMENT_BENCHMARKS(Binary, Archive);
DOCUMENT_BENCHMARKS(Binary, Stream);
DOCUMENT_BENCHMARKS(Xml, Archive);
DOCUMENT_BENCHMARKS(Xml, Stream);
DOCUMENT_BENCHMARKS(Json, Archive);
DOCUMENT_BENCHMARKS(Json, Stream);

using Ratios::compare;

const bool compared =
    compare("binary archive, save : Boost by hand", "BinarySave", "BinarySaveByHand", 1.15) &&
    compare("binary archive, load : Boost by hand", "BinaryLoad", "BinaryLoadByHand", 1.15) &&
    compare("XML archive, save : Boost by hand", "XmlSave", "XmlSaveByHand", 1.15) &&
    compare("XML archive, load : Boost by hand", "XmlLoad", "XmlLoadByHand", 1.15) &&
    compare("Json archive, save : a tree by hand and its dump", "JsonSave", "JsonSaveByHand", 1.3) &&
    compare("Json archive, load : a parse and reading by hand", "JsonLoad", "JsonLoadByHand", 1.3);

} // namespace

int main(int argc, char** argv)
{
    keepMemory();
    return Ratios::run(argc, argv);
}
