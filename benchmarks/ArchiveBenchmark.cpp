// SPDX-License-Identifier: Apache-2.0
// Ten thousand records with pointers, saved and loaded: through the library's field lists, beside the same
// records with Boost.Serialization's templates, and with a tree of nlohmann json, used by hand.
#include "Ratio.h"

#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Document.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/persistence/Json.h>
#include <EditorModel/types/MTime.h>

#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>
#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>
#include <boost/serialization/deque.hpp>
#include <boost/serialization/export.hpp>
#include <boost/serialization/nvp.hpp>
#include <boost/serialization/string.hpp>

#include <benchmark/benchmark.h>

#include <QBuffer>

#include <malloc.h>

#include <sstream>
#include <stdexcept>
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

} // namespace ByHand

BOOST_CLASS_EXPORT_GUID(ByHand::Record, "Hand_::Record")
BOOST_CLASS_EXPORT_GUID(ByHand::Content, "Hand_::Content")

namespace {

using boost::serialization::make_nvp;
using nlohmann::json;

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

template <class Content>
void freeRecords(Content* content)
{
    for (const auto* const record : content->records)
        delete record;
    delete content;
}

template <class Archive, class Content>
std::string stored(const Content& content)
{
    std::ostringstream stream;
    {
        Archive archive(stream);
        const Content* const root = &content;
        archive << make_nvp("content", root);
    }
    return stream.str();
}

template <class Archive, class Content>
void boostSave(benchmark::State& state, const Content& content)
{
    for (auto _ : state)
        benchmark::DoNotOptimize(stored<Archive>(content));
}

template <class Output, class Input, class Content>
void boostLoad(benchmark::State& state, const Content& content)
{
    const std::string text = stored<Output>(content);
    for (auto _ : state) {
        std::istringstream stream(text);
        Content* loaded = nullptr;
        {
            Input archive(stream);
            archive >> make_nvp("content", loaded);
        }
        benchmark::DoNotOptimize(loaded->records.size());
        freeRecords(loaded);
    }
}

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

std::string jsonByArchive(const Listed::Content& content)
{
    json root;
    {
        Serialize::Json::oarchive archive(root);
        const Listed::Content* const object = &content;
        archive << make_nvp("content", object);
    }
    return root.dump();
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

void jsonSave(benchmark::State& state)
{
    if (jsonByArchive(listed().content) != treeByHand(byHand().content).dump())
        state.SkipWithError("the tree written by hand is not the archive's");
    for (auto _ : state)
        benchmark::DoNotOptimize(jsonByArchive(listed().content));
}

void jsonSaveByHand(benchmark::State& state)
{
    for (auto _ : state)
        benchmark::DoNotOptimize(treeByHand(byHand().content).dump());
}

void jsonLoad(benchmark::State& state)
{
    const std::string text = jsonByArchive(listed().content);
    for (auto _ : state) {
        const json root = json::parse(text);
        Listed::Content* content = nullptr;
        Serialize::Json::iarchive archive(root);
        archive >> make_nvp("content", content);
        benchmark::DoNotOptimize(content->records.size());
        freeRecords(content);
    }
}

void jsonLoadByHand(benchmark::State& state)
{
    const std::string text = jsonByArchive(listed().content);
    for (auto _ : state) {
        const json root = json::parse(text);
        auto* const content = readByHand(root);
        benchmark::DoNotOptimize(content->records.size());
        freeRecords(content);
    }
}

QByteArray documentOf(Document::Form form, Document::Route route)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    Document::save(buffer, listed().content, form, route);
    return buffer.data();
}

void documentSave(benchmark::State& state, Document::Form form, Document::Route route)
{
    qint64 size = 0;
    for (auto _ : state)
        size = documentOf(form, route).size();
    state.counters["bytes/record"] = static_cast<double>(size) / recordCount;
}

void documentLoad(benchmark::State& state, Document::Form form, Document::Route route)
{
    QByteArray document = documentOf(form, route);
    for (auto _ : state) {
        QBuffer buffer(&document);
        buffer.open(QIODevice::ReadOnly);
        benchmark::DoNotOptimize(Document::load(buffer).size());
    }
}

using boost::archive::binary_iarchive;
using boost::archive::binary_oarchive;
using boost::archive::xml_iarchive;
using boost::archive::xml_oarchive;

void BinarySave(benchmark::State& state)
{
    boostSave<binary_oarchive>(state, listed().content);
}
void BinarySaveByHand(benchmark::State& state)
{
    boostSave<binary_oarchive>(state, byHand().content);
}
void BinaryLoad(benchmark::State& state)
{
    boostLoad<binary_oarchive, binary_iarchive>(state, listed().content);
}
void BinaryLoadByHand(benchmark::State& state)
{
    boostLoad<binary_oarchive, binary_iarchive>(state, byHand().content);
}
void XmlSave(benchmark::State& state)
{
    boostSave<xml_oarchive>(state, listed().content);
}
void XmlSaveByHand(benchmark::State& state)
{
    boostSave<xml_oarchive>(state, byHand().content);
}
void XmlLoad(benchmark::State& state)
{
    boostLoad<xml_oarchive, xml_iarchive>(state, listed().content);
}
void XmlLoadByHand(benchmark::State& state)
{
    boostLoad<xml_oarchive, xml_iarchive>(state, byHand().content);
}

BENCHMARK(BinarySave);
BENCHMARK(BinarySaveByHand);
BENCHMARK(BinaryLoad);
BENCHMARK(BinaryLoadByHand);
BENCHMARK(XmlSave);
BENCHMARK(XmlSaveByHand);
BENCHMARK(XmlLoad);
BENCHMARK(XmlLoadByHand);
BENCHMARK(jsonSave)->Name("JsonSave");
BENCHMARK(jsonSaveByHand)->Name("JsonSaveByHand");
BENCHMARK(jsonLoad)->Name("JsonLoad");
BENCHMARK(jsonLoadByHand)->Name("JsonLoadByHand");

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
    // Memory that goes back to the system between two rounds would be measured with whichever asks for it
    // next.
    mallopt(M_TRIM_THRESHOLD, 1 << 30);
    mallopt(M_MMAP_THRESHOLD, 1 << 30);
    return Ratios::run(argc, argv);
}
