// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Fields.h>
#include <EditorModel/types/Pen.h>
#include <EditorModel/types/Rect.h>
#include <EditorModel/types/Transform.h>

#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <utility>
#include <variant>
#include <vector>

namespace {

// Values are parts of other objects, and not watched by themselves.
static_assert(!std::is_base_of_v<PubSub::Object, Types::Transform>);
static_assert(!std::is_base_of_v<PubSub::Object, Types::Pen>);
static_assert(!std::is_base_of_v<PubSub::Object, Types::Rect>);

using Field = std::pair<std::string, double>;

// Writes down the fields of a class that has nothing but numbers and flags.
class Recorder : public Serialize::Fields
{
public:
    std::vector<Field> recorded;

    Recorder() : Fields(false) {}

private:
    void onScalar(const Serialize::Key& key, const Serialize::Scalar& value, const void*) override
    {
        EXPECT_STREQ(key.archive, key.stream);
        const auto number = [](const auto* field) -> double {
            using Value = std::decay_t<decltype(*field)>;
            if constexpr (std::is_arithmetic_v<Value>)
                return static_cast<double>(*field);
            else
                throw std::logic_error("not a number");
        };
        recorded.emplace_back(key.archive, std::visit(number, value));
    }

    void onObject(const Serialize::Key&, const Serialize::Type&, void*) override { refuse(); }
    void onBase(const Serialize::Key&, const Serialize::Type&, void*) override { refuse(); }
    void onPointer(const Serialize::Key&, const Serialize::PointerField&) override { refuse(); }
    void onContainer(const Serialize::Key&, const Serialize::Type&, void*) override { refuse(); }
    int onBeginSequence(Serialize::SequenceKind, int) override { refuse(); }
    void onBeginItem(int) override { refuse(); }
    void onEndItem(int) override { refuse(); }
    void onEndSequence(int) override { refuse(); }
    void onEntry(const Serialize::Type&, void*) override { refuse(); }
    void onBinary(QByteArray&, int) override { refuse(); }
    std::shared_ptr<const Types::Image> onShare(const Types::Image*) override { refuse(); }

    [[noreturn]] static void refuse() { throw std::logic_error("not a plain field"); }
};

template <class T>
std::vector<Field> fieldsOf(T object)
{
    Recorder recorder;
    T::persistentType().visit(recorder, &object);
    return recorder.recorded;
}

template <class T>
void isMadeByName(const std::string& name)
{
    EXPECT_EQ(name, T::NameInArchive());
    EXPECT_EQ(name, T().GetNameInArchive());
    const Serialize::BaseCreator* creator = Serialize::findCreator(name);
    ASSERT_NE(nullptr, creator);
    const std::unique_ptr<Serialize::ISerializable> object(creator->Create());
    EXPECT_NE(nullptr, dynamic_cast<T*>(object.get()));
}

TEST(FieldLists, OfATransformGoRowByRow)
{
    const std::vector<Field> expected = {{"m11", 1}, {"m12", 2}, {"m13", 3}, {"m21", 4}, {"m22", 5},
                                         {"m23", 6}, {"m31", 7}, {"m32", 8}, {"m33", 9}};
    EXPECT_EQ(expected, fieldsOf(Types::Transform(1, 2, 3, 4, 5, 6, 7, 8, 9)));
}

TEST(FieldLists, OfAPenAreColorWidthEnabled)
{
    const std::vector<Field> expected = {{"color", 4278190080.0}, {"width", 7}, {"enabled", 1}};
    EXPECT_EQ(expected, fieldsOf(Types::Pen(0xFF000000, 7, true)));
}

TEST(FieldLists, OfARectGoInAnotherOrderThanItsConstructor)
{
    const std::vector<Field> expected = {{"top", 2}, {"left", 1}, {"bottom", 4}, {"right", 3}};
    EXPECT_EQ(expected, fieldsOf(Types::Rect(1, 2, 3, 4)));
}

TEST(FieldLists, BelongToClassesThatAreMadeByName)
{
    isMadeByName<Types::Transform>("Types::Transform");
    isMadeByName<Types::Pen>("Types::Pen");
    isMadeByName<Types::Rect>("Types::Rect");
}

} // namespace
