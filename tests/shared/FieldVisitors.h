// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Fields.h>

#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

/// Visitors of field lists that the tests own: they know every persistent class without naming one.
namespace Testing {

/// Texts that go wrong where somebody is careless: markup, quotes, control characters, line ends, blanks at
/// either end, other scripts, characters outside the first plane, and those that XML forbids.
const std::vector<QString>& awkwardTexts();

/// What a graph holds, as text: keys in order, values in full, objects numbered in the order of meeting, so
/// that two graphs of one shape and content give one text.
class Dump final : public Serialize::Fields
{
public:
    /// `wrapTimes` gives times as they are after a store of 32 bits.
    explicit Dump(bool wrapTimes = false) : Fields(false), m_wrapTimes(wrapTimes) {}

    const std::string& text() const { return m_text; }

    static std::string of(const Serialize::ISerializable& object, bool wrapTimes = false);

private:
    void onScalar(const Serialize::Key& key, const Serialize::Scalar& value, const void* address) override;
    void onObject(const Serialize::Key& key, const Serialize::Type& type, void* object) override;
    void onBase(const Serialize::Key& key, const Serialize::Type& type, void* object) override;
    void onPointer(const Serialize::Key& key, const Serialize::PointerField& field) override;
    void onContainer(const Serialize::Key& key, const Serialize::Type& type, void* container) override;
    int onBeginSequence(Serialize::SequenceKind kind, int count) override;
    void onBeginItem(int index) override;
    void onEndItem(int) override {}
    void onEndSequence(int) override {}
    void onEntry(const Serialize::Type& pair, void* entry) override;
    void onBinary(QByteArray& bytes, int size) override;
    std::shared_ptr<const Types::Image> onShare(const Types::Image*) override { return nullptr; }

    /// What an item holds itself, its object included; pointers from there, which may lead back to the item,
    /// and what is ordered by them are not followed.
    std::string outline(int item, const Serialize::Type& type, void* container) const;
    void line(const std::string& text);
    void nested(const Serialize::Type& type, void* object);
    void onlyItem(int item, const Serialize::Type& type, void* container);
    int countOf(const Serialize::Type& type, void* container) const;

    const bool m_wrapTimes;
    int m_indent = 0;
    bool m_isOutline = false;
    int m_pointersFollowed = 0;
    /// How many containers are open; items other than `m_item` of the container at `m_itemLevel` are passed
    /// over.
    int m_level = 0;
    int m_itemLevel = 0;
    int m_item = 0;
    int m_count = 0;
    bool m_muted = false;
    std::string m_text;
    std::map<std::pair<const void*, const Serialize::Type*>, int> m_numbers;
};

/// Gives every field a value of its own that is not its default; makes the objects that pointers need, some
/// of them shared and in cycles. What it makes lives as long as the filler.
class Filler final : public Serialize::Fields
{
public:
    /// Times are counted up from `firstTime`.
    explicit Filler(MTime firstTime = MTime(1)) : Fields(true), m_time(firstTime) {}
    ~Filler() override;

    /// A filled object of a type, owned by the filler.
    Serialize::ISerializable* make(const Serialize::Type& type);

private:
    void onScalar(const Serialize::Key& key, const Serialize::Scalar& value, const void* address) override;
    void onObject(const Serialize::Key& key, const Serialize::Type& type, void* object) override;
    void onBase(const Serialize::Key& key, const Serialize::Type& type, void* object) override;
    void onPointer(const Serialize::Key& key, const Serialize::PointerField& field) override;
    void onContainer(const Serialize::Key& key, const Serialize::Type& type, void* container) override;
    int onBeginSequence(Serialize::SequenceKind kind, int count) override;
    void onBeginItem(int) override {}
    void onEndItem(int) override {}
    void onEndSequence(int) override {}
    void onEntry(const Serialize::Type& pair, void* entry) override;
    void onBinary(QByteArray& bytes, int size) override;
    std::shared_ptr<const Types::Image> onShare(const Types::Image*) override { return nullptr; }

    struct Made
    {
        const Serialize::Type* type;
        Serialize::ISerializable* object;
    };

    int m_count = 0;
    int m_depth = 0;
    MTime m_time;
    std::vector<Made> m_made;
};

} // namespace Testing
