// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/Fields.h>

#include <EditorModel/persistence/FailurePlace.h>
#include <EditorModel/persistence/Roots.h>
#include <EditorModel/persistence/archives/Registration.h>

#include <QSet>

#if defined(__unix__)
#include <dlfcn.h>
#endif

#include <cstring>
#include <stdexcept>
#include <typeindex>
#include <unordered_map>

namespace Serialize {
namespace Details {
namespace {

constexpr std::size_t longestPlace = 300;

thread_local std::string failurePlace;
thread_local int depth = 0;

struct DepthGuard
{
    explicit DepthGuard(int& aDepth) : level(aDepth)
    {
        if (level == 0)
            FailurePlace::clear();
        if (level == maxDepth)
            throw std::runtime_error("objects nest deeper than " + std::to_string(maxDepth) + " levels");
        ++level;
    }
    ~DepthGuard() { --level; }

    int& level;
};

/// The tables of classes, Boost's among them, keep addresses in the module that a class came in: it stays.
void keepLoaded([[maybe_unused]] const void* address)
{
#if defined(__unix__)
    static const void* lastModule = nullptr;
    Dl_info module;
    if (dladdr(address, &module) == 0 || module.dli_fbase == lastModule)
        return;
    lastModule = module.dli_fbase;
    dlopen(module.dli_fname, RTLD_LAZY | RTLD_NOLOAD | RTLD_NODELETE);
#endif
}

/// Entered classes, by what they are looked up by. Written by static initialisers alone, which the loader
/// runs one at a time; never destroyed, as static destructors may still save.
struct Classes
{
    std::unordered_map<std::type_index, const Type*> byInfo;
    std::unordered_map<std::string, const Type*> byName;
};

Classes& classes()
{
    static Classes* const instance = new Classes;
    return *instance;
}

} // namespace

void FailurePlace::clear()
{
    failurePlace.clear();
}

void FailurePlace::add(const char* key, int item)
{
    // Of a way that is longer than a reader wants, the end says most.
    if (failurePlace.size() > longestPlace) {
        if (failurePlace.compare(0, 4, ".../") != 0)
            failurePlace.insert(0, ".../");
        return;
    }
    std::string step = item > 0 ? "[" + std::to_string(item) + "]" : std::string(key);
    if (!failurePlace.empty() && failurePlace.front() != '[')
        step += '/';
    failurePlace.insert(0, step);
}

const std::string& FailurePlace::text()
{
    return failurePlace;
}

TypeEntry::TypeEntry(const Type& type)
{
    keepLoaded(&type);
    classes().byInfo.emplace(type.info, &type);
    if (type.exported)
        classes().byName.emplace(type.name, &type);
    enterForms(type);
}

Pointee pointee(const void* object, const std::type_info& info, const Type* guess)
{
    return Pointee{const_cast<void*>(object), findType(info, guess)};
}

void visit(Fields& fields, const Type& type, void* object)
{
    const DepthGuard guard(depth);
    const Fields::Position outer = std::exchange(fields.m_position, {});
    try {
        type.visit(fields, object);
    } catch (...) {
        fields.m_position.note();
        fields.m_position = outer;
        throw;
    }
    fields.m_position = outer;
}

void visitRoots(Fields& fields, Roots& roots)
{
    atRoots([&] { fields(rootsKey, roots); });
}

void throwRepeatedKey()
{
    throw std::runtime_error("the key of a map stands twice");
}

void visitTexts(Fields& fields, QMap<QString, QString>& texts)
{
    const int count = fields.beginSequence(QtCollection, texts.size());
    const QMap<QString, QString> stored = fields.loading() ? QMap<QString, QString>() : texts;
    if (fields.loading() && !fields.keepsEntries())
        texts.clear();
    QSet<QString> readKeys;
    auto position = stored.begin();
    for (int index = 1; index <= count; ++index) {
        std::pair<const QString, QString> item;
        if (!fields.loading()) {
            const_cast<QString&>(item.first) = position.key();
            item.second = position.value();
            ++position;
        }
        using Entry = std::pair<const QString, QString>;
        static const Type entry{typeid(Entry), [](Fields& f, void* pair) {
                                    auto& text = *static_cast<Entry*>(pair);
                                    f({"first", "Key"}, const_cast<QString&>(text.first));
                                    f({"second", "Value"}, text.second);
                                }};
        fields.beginItem(index);
        fields.entry(entry, &item);
        fields.endItem(index);
        if (fields.loading()) {
            if (readKeys.contains(item.first))
                throwRepeatedKey();
            readKeys.insert(item.first);
            texts.insert(item.first, item.second);
        }
    }
    fields.endSequence(count);
}

} // namespace Details

const Type* findType(const std::type_info& info, const Type* guess)
{
    if (guess && guess->info == info)
        return guess;
    const auto found = Details::classes().byInfo.find(info);
    return found == Details::classes().byInfo.end() ? nullptr : found->second;
}

const Type* findType(const std::string& name)
{
    const auto found = Details::classes().byName.find(name);
    return found == Details::classes().byName.end() ? nullptr : found->second;
}

Fields::~Fields() = default;

void Fields::Position::note() const
{
    if (!key.archive)
        return;
    const bool isItem = std::strcmp(key.stream, Details::itemKey.stream) == 0;
    Details::FailurePlace::add(key.archive, isItem ? item : 0);
}

void Fields::baseFields(const char* key, const Type& type, void* object)
{
    m_position.key = Key(key, "BaseOfObject");
    onBase(m_position.key, type, object);
}

int Fields::beginSequence(SequenceKind kind, int count)
{
    return onBeginSequence(kind, count);
}

void Fields::beginItem(int index)
{
    m_position.item = index;
    onBeginItem(index);
}

void Fields::endItem(int index)
{
    onEndItem(index);
}

void Fields::endSequence(int count)
{
    onEndSequence(count);
}

void Fields::entry(const Type& pair, void* entry)
{
    m_position.key = Details::itemKey;
    onEntry(pair, entry);
}

void Fields::binary(QByteArray& bytes, int size)
{
    onBinary(bytes, size);
}

std::shared_ptr<const Types::Image> Fields::share(const Types::Image* image)
{
    return onShare(image);
}

} // namespace Serialize
