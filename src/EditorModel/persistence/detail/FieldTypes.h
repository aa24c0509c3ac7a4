// SPDX-License-Identifier: Apache-2.0
#pragma once

// How each C++ type is visited as a field; part of <EditorModel/persistence/Fields.h>.

#include <EditorModel/persistence/Fields.h>

#include <QList>
#include <QMap>

#include <deque>
#include <map>
#include <set>
#include <tuple>
#include <utility>

namespace Serialize {

namespace Details {

/// What the complete object at `object` is; `guess` is the type that it most likely has.
EDITORMODEL_EXPORT Pointee pointee(const void* object, const std::type_info& info, const Type* guess);

[[noreturn]] EDITORMODEL_EXPORT void throwRepeatedKey();

/// Objects nested deeper than this, by value or through pointers, are refused on saving and loading alike:
/// each level takes stack.
constexpr int maxDepth = 1000;

template <class T>
using ScalarField = std::enable_if_t<std::is_constructible_v<Scalar, std::in_place_type_t<T*>, T*>>;

template <class T>
struct FieldOf<T, ScalarField<T>>
{
    static void visit(Fields& fields, const Key& key, T& value)
    {
        fields.scalar(key, Scalar(&value), &value);
    }
};

template <class T>
struct FieldOf<T, std::enable_if_t<std::is_enum_v<T>>>
{
    static_assert(std::is_same_v<std::underlying_type_t<T>, int>, "enumerations are stored as int");
    static void visit(Fields& fields, const Key& key, T& value)
    {
        int number = value;
        fields.scalar(key, Scalar(&number), &value);
        if (fields.loading())
            value = static_cast<T>(number);
    }
};

template <class T>
struct FieldOf<T, std::enable_if_t<isPersistent<T>>>
{
    static void visit(Fields& fields, const Key& key, T& value)
    {
        fields.object(key, T::persistentType(), &value);
    }
};

/// The pointers of a field declared with `Class`.
template <class Class>
struct PointersTo
{
    static Class*& target(const PointerField& field) { return *static_cast<Class**>(field.slot); }

    static Pointee get(const PointerField& field)
    {
        const Class* const object = target(field);
        return object ? pointee(dynamic_cast<const void*>(object), typeid(*object), field.declared)
                      : Pointee{nullptr, nullptr};
    }

    static const ISerializable* root(const PointerField& field) { return target(field); }

    static void set(const PointerField& field, const Pointee& pointee)
    {
        if (pointee.object && pointee.type == field.declared)
            target(field) = static_cast<Class*>(pointee.object);
        else if (pointee.object && !pointee.type->serializable)
            refuse(field);
        else
            setRoot(field, pointee.object ? pointee.type->serializable(pointee.object) : nullptr);
    }

    static void setRoot(const PointerField& field, ISerializable* root)
    {
        target(field) = dynamic_cast<Class*>(root);
        if (root && !target(field))
            refuse(field);
    }

    static void refuse(const PointerField& field)
    {
        target(field) = nullptr;
        if (!field.soft)
            throw std::bad_cast();
    }

    static constexpr PointerAccess access{&get, &root, &set, &setRoot};
};

template <class T>
PointerField pointerField(T*& slot, bool soft)
{
    using Class = std::remove_cv_t<T>;
    const Type* declared = nullptr;
    if constexpr (isPersistent<Class> && !std::is_abstract_v<Class>)
        declared = &Class::persistentType();
    return PointerField{PointersTo<Class>::access, declared, const_cast<Class**>(&slot), soft};
}

template <class T>
struct FieldOf<T*>
{
    static_assert(std::is_base_of_v<ISerializable, std::remove_cv_t<T>>, "pointers go to persistent objects");
    static void visit(Fields& fields, const Key& key, T*& pointer)
    {
        fields.pointer(key, pointerField(pointer, false));
    }
};

/// Boost keeps no class information for standard collections of numbers.
template <class C>
constexpr bool isPlainCollection = false;
template <class T>
constexpr bool isPlainCollection<std::deque<T>> = std::is_arithmetic_v<T>;
template <class T, class Less>
constexpr bool isPlainCollection<std::set<T, Less>> = std::is_arithmetic_v<T>;

/// The type constant of a container, whose field list is `visitItems`.
template <class C>
void visitItems(Fields& fields, void* container);

template <class C>
const Type& containerType()
{
    static const Type type{typeid(C), &visitItems<C>, nullptr, false, !isPlainCollection<C>};
    return type;
}

constexpr Key itemKey{"item", "Data"};

/// Items that a reader appends and fills where they stand: an archive may note their addresses.
template <class C>
void visitSequence(Fields& fields, C& container, SequenceKind kind)
{
    const int count = fields.beginSequence(kind, static_cast<int>(container.size()));
    if (fields.loading() && !fields.keepsEntries())
        container.clear();
    // Through a constant: a Qt container that is shared must not become one of its own by being looked at.
    auto position = std::as_const(container).begin();
    for (int index = 1; index <= count; ++index) {
        fields.beginItem(index);
        if (fields.loading()) {
            container.push_back({});
            fields(itemKey, container.back());
        } else {
            fields(itemKey, const_cast<typename C::value_type&>(*position++));
        }
        fields.endItem(index);
    }
    fields.endSequence(count);
}

template <class T>
struct ItemsOf;

template <class T>
struct ItemsOf<std::deque<T>>
{
    static void visit(Fields& fields, std::deque<T>& items) { visitSequence(fields, items, Collection); }
};

template <class T>
struct ItemsOf<QList<T>>
{
    static_assert(std::is_pointer_v<T>, "a QList moves what it holds by value");
    static void visit(Fields& fields, QList<T>& items) { visitSequence(fields, items, QtCollection); }
};

template <class T, class Less>
struct ItemsOf<std::set<T, Less>>
{
    static_assert(!isPersistent<T>, "an object that is read and then moved loses its identity");
    static void visit(Fields& fields, std::set<T, Less>& items)
    {
        const int count = fields.beginSequence(Collection, static_cast<int>(items.size()));
        if (fields.loading() && !fields.keepsEntries())
            items.clear();
        auto position = items.begin();
        for (int index = 1; index <= count; ++index) {
            fields.beginItem(index);
            if (fields.loading()) {
                T item{};
                fields(itemKey, item);
                items.insert(std::move(item));
            } else {
                fields(itemKey, const_cast<T&>(*position++));
            }
            fields.endItem(index);
        }
        fields.endSequence(count);
    }
};

/// A map while its entries are read. Those that it had before are kept aside, so that a key that is read
/// twice is told from one that was there, and are back in their places at the end, however that comes.
template <class Map>
struct MapReading
{
    MapReading(Map& target, bool keepsEntries) : map(target)
    {
        if (keepsEntries)
            earlier.swap(map);
        else
            map.clear();
    }
    ~MapReading() { map.merge(earlier); }
    MapReading(const MapReading&) = delete;
    MapReading& operator=(const MapReading&) = delete;

    /// The value to read into: the earlier one with the key, where there is one.
    typename Map::mapped_type& place(typename Map::key_type&& key)
    {
        if (auto node = earlier.extract(key))
            return map.insert(std::move(node)).position->second;
        const auto entry = map.try_emplace(std::move(key));
        if (!entry.second)
            throwRepeatedKey();
        return entry.first->second;
    }

    Map& map;
    Map earlier;
};

/// One entry of a map: its key is read first, and then the value at its place in the map.
template <class Map>
struct MapEntry
{
    using Pair = typename Map::value_type;

    MapReading<Map>* reading;
    Pair* pair;

    static void visit(Fields& fields, void* object)
    {
        auto& entry = *static_cast<MapEntry*>(object);
        if (!fields.loading()) {
            fields({"first", "Key"}, const_cast<typename Map::key_type&>(entry.pair->first));
            fields({"second", "Value"}, entry.pair->second);
            return;
        }
        typename Map::key_type key{};
        fields({"first", "Key"}, key);
        fields({"second", "Value"}, entry.reading->place(std::move(key)));
    }

    static const Type& type()
    {
        static const Type type{typeid(Pair), &visit};
        return type;
    }
};

template <class K, class V, class Less>
struct ItemsOf<std::map<K, V, Less>>
{
    static_assert(!isPersistent<K>, "an object that is read and then moved loses its identity");
    using Map = std::map<K, V, Less>;

    static void visit(Fields& fields, Map& map)
    {
        const int count = fields.beginSequence(Collection, static_cast<int>(map.size()));
        if (fields.loading()) {
            MapReading<Map> reading(map, fields.keepsEntries());
            visitEntries(fields, count, [&] { return MapEntry<Map>{&reading, nullptr}; });
        } else {
            auto position = map.begin();
            visitEntries(fields, count, [&] { return MapEntry<Map>{nullptr, &*position++}; });
        }
        fields.endSequence(count);
    }

private:
    template <class Next>
    static void visitEntries(Fields& fields, int count, Next next)
    {
        for (int index = 1; index <= count; ++index) {
            fields.beginItem(index);
            MapEntry<Map> entry = next();
            fields.entry(MapEntry<Map>::type(), &entry);
            fields.endItem(index);
        }
    }
};

template <class First, class Second>
struct ItemsOf<std::pair<First, Second>>
{
    static void visit(Fields& fields, std::pair<First, Second>& pair)
    {
        fields.beginSequence(Group, 1);
        fields.beginItem(1);
        fields({"first", "First"}, const_cast<std::remove_const_t<First>&>(pair.first));
        fields({"second", "Second"}, pair.second);
        fields.endItem(1);
        fields.endSequence(1);
    }
};

template <class... Elements>
struct ItemsOf<std::tuple<Elements...>>
{
    static void visit(Fields& fields, std::tuple<Elements...>& tuple)
    {
        constexpr int count = sizeof...(Elements);
        fields.beginSequence(Group, count);
        int index = 0;
        const auto element = [&](auto& value) {
            fields.beginItem(++index);
            fields(Key{"element", "Data"}, value);
            fields.endItem(index);
        };
        std::apply([&](auto&... values) { (element(values), ...); }, tuple);
        fields.endSequence(count);
    }
};

/// QMap<QString, QString>, item by item through a pair.
EDITORMODEL_EXPORT void visitTexts(Fields& fields, QMap<QString, QString>& texts);

template <>
struct ItemsOf<QMap<QString, QString>>
{
    static void visit(Fields& fields, QMap<QString, QString>& texts) { visitTexts(fields, texts); }
};

template <class C>
void visitItems(Fields& fields, void* container)
{
    ItemsOf<C>::visit(fields, *static_cast<C*>(container));
}

template <class C>
struct FieldOf<C, std::void_t<decltype(&ItemsOf<C>::visit)>>
{
    static void visit(Fields& fields, const Key& key, C& container)
    {
        fields.container(key, containerType<C>(), &container);
    }
};

} // namespace Details

} // namespace Serialize
