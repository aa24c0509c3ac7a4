// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/shared/FieldVisitors.h"

#include <EditorModel/analysis/OverlayLinkInfo.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/Decibel.h>
#include <EditorModel/types/MTime.h>
#include <EditorModel/types/Range.h>

#include <QMap>
#include <QPointF>
#include <QSet>
#include <QString>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory>
#include <string>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

/// Values to try a field with, by its type, and whether two values are the same.
namespace FieldTests {

/// A list of values of every kind that a careful setter might refuse. Where a type's own equality won't do,
/// there is `same` as well.
template <class T>
struct Values;

template <class T, class = void>
constexpr bool comparesValues = false;
template <class T>
constexpr bool
    comparesValues<T, std::void_t<decltype(Values<T>::same(std::declval<T>(), std::declval<T>()))>> = true;

template <class T, class = void>
constexpr bool isContainer = false;
template <class T>
constexpr bool isContainer<T, std::void_t<typename T::value_type, decltype(std::declval<T>().begin())>> =
    !std::is_same_v<T, QString> && !std::is_same_v<T, std::string>;

template <class T>
bool same(const T& a, const T& b);

template <class K, class V>
bool same(const QMap<K, V>& a, const QMap<K, V>& b)
{
    return a == b;
}

template <class T>
bool same(const QSet<T>& a, const QSet<T>& b)
{
    return a == b;
}

template <class A, class B>
bool same(const std::pair<A, B>& a, const std::pair<A, B>& b)
{
    return same(a.first, b.first) && same(a.second, b.second);
}

/// Exact where an operator of the type is not: nothing is fuzzy, no stored field is passed over, and a
/// not-a-number is the same as another.
template <class T>
bool same(const T& a, const T& b)
{
    if constexpr (std::is_floating_point_v<T>) {
        return a == b || (std::isnan(a) && std::isnan(b));
    } else if constexpr (comparesValues<T>) {
        return Values<T>::same(a, b);
    } else if constexpr (std::is_base_of_v<Serialize::ISerializable, T>) {
        return Testing::Dump::of(a) == Testing::Dump::of(b);
    } else if constexpr (isContainer<T>) {
        auto other = b.begin();
        for (auto item = a.begin(); item != a.end(); ++item, ++other) {
            if (other == b.end() || !same(*item, *other))
                return false;
        }
        return other == b.end();
    } else {
        return a == b;
    }
}

/// Never looked into: the address alone counts.
template <class T>
T* somewhere(std::uintptr_t address)
{
    return reinterpret_cast<T*>(address);
}

template <class T>
std::vector<T> extremes()
{
    using Limits = std::numeric_limits<T>;
    return {T(1), T(-1), T(7), Limits::min(), Limits::max(), T(0)};
}

Testing::Filler& filler();

template <class T>
struct Values
{
    static std::vector<T> all()
    {
        if constexpr (std::is_same_v<T, bool>) {
            return {true, false};
        } else if constexpr (std::is_floating_point_v<T>) {
            using Limits = std::numeric_limits<T>;
            return {0.5, -0.5, Limits::quiet_NaN(), Limits::infinity(), -Limits::infinity(), Limits::max(),
                    1.0, 0.0};
        } else if constexpr (std::is_integral_v<T>) {
            return extremes<T>();
        } else if constexpr (std::is_enum_v<T>) {
            std::vector<T> values;
            for (const int value : extremes<int>())
                values.push_back(static_cast<T>(value));
            return values;
        } else if constexpr (std::is_pointer_v<T>) {
            using Object = std::remove_pointer_t<T>;
            return {somewhere<Object>(0x1000), somewhere<Object>(0x2000), nullptr};
        } else if constexpr (isContainer<T>) {
            T one;
            T several;
            for (const auto& value : Values<typename T::value_type>::all()) {
                several.insert(several.end(), value);
                if (one.empty())
                    one = several;
            }
            return {several, one, T()};
        } else {
            T filled;
            T::persistentType().visit(filler(), &filled);
            return {filled, T()};
        }
    }
};

template <class A, class B>
struct Values<std::pair<A, B>>
{
    static std::vector<std::pair<A, B>> all()
    {
        const auto first = Values<std::remove_const_t<A>>::all();
        const auto second = Values<B>::all();
        std::vector<std::pair<A, B>> values;
        for (std::size_t i = 0; i != std::max(first.size(), second.size()); ++i)
            values.emplace_back(first[i % first.size()], second[i % second.size()]);
        return values;
    }
};

template <class A, class B>
struct Values<std::tuple<A, B>>
{
    static std::vector<std::tuple<A, B>> all()
    {
        std::vector<std::tuple<A, B>> values;
        for (const std::pair<A, B>& value : Values<std::pair<A, B>>::all())
            values.emplace_back(value.first, value.second);
        return values;
    }
};

template <class K, class V>
struct Values<QMap<K, V>>
{
    static std::vector<QMap<K, V>> all()
    {
        QMap<K, V> several;
        for (const std::pair<K, V>& value : Values<std::pair<K, V>>::all())
            several.insert(value.first, value.second);
        return {several, {{K(), V()}}, {}};
    }
};

template <class T>
struct Values<QSet<T>>
{
    static std::vector<QSet<T>> all()
    {
        QSet<T> several;
        for (const T& value : Values<T>::all())
            several.insert(value);
        return {several, {T()}, {}};
    }
};

template <class T>
struct Values<std::shared_ptr<T>>
{
    static std::vector<std::shared_ptr<T>> all()
    {
        return {std::shared_ptr<T>(std::shared_ptr<void>(), somewhere<T>(0x1000)),
                std::shared_ptr<T>(std::shared_ptr<void>(), somewhere<T>(0x2000)), nullptr};
    }
};

template <>
struct Values<MTime>
{
    static std::vector<MTime> all();
};
template <>
struct Values<QString>
{
    static std::vector<QString> all();
};
template <>
struct Values<std::string>
{
    static std::vector<std::string> all();
};
template <>
struct Values<QPointF>
{
    static std::vector<QPointF> all();
    static bool same(const QPointF& a, const QPointF& b);
};
template <>
struct Values<Types::Range>
{
    static std::vector<Types::Range> all();
};
template <>
struct Values<Decibel>
{
    static std::vector<Decibel> all();
    static bool same(const Decibel& a, const Decibel& b);
};
template <>
struct Values<MotionTracking::OverlayLinkInfo>
{
    static std::vector<MotionTracking::OverlayLinkInfo> all();
    static bool same(const MotionTracking::OverlayLinkInfo& a, const MotionTracking::OverlayLinkInfo& b);
};

} // namespace FieldTests
