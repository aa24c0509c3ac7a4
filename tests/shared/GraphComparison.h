// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/types/MTime.h>

#include <QPointF>
#include <QString>

#include <algorithm>
#include <cstddef>
#include <deque>
#include <map>
#include <set>
#include <string>
#include <typeinfo>
#include <utility>
#include <vector>

namespace Testing {

/// Walks two graphs in step and notes the places where they differ. `Derived` tells the fields of its classes
/// by overloads of `same`, beside `using GraphComparison::same`, and the names by `nameOf` of what stands in
/// sets and maps in the order of addresses. Of each pair of objects the first is of the stored graph, and the
/// second of the loaded one.
template <class Derived>
class GraphComparison
{
public:
    explicit GraphComparison(bool wrapsTimes) : m_wrapsTimes(wrapsTimes) {}

    const std::vector<std::string>& differences() const { return m_differences; }

    template <class T>
    void partners(const T& a, const T& b)
    {
        self().same(&a, &b);
    }

protected:
    // Values

    template <class V>
    void same(const V& a, const V& b)
    {
        if (!(a == b))
            differ();
    }

    void same(MTime a, MTime b)
    {
        const qint64 expected = m_wrapsTimes ? static_cast<qint32>(static_cast<quint32>(a.ms())) : a.ms();
        if (expected != b.ms())
            differ();
    }

    /// Exact, which the point's own comparison is not.
    void same(const QPointF& a, const QPointF& b)
    {
        if (a.x() != b.x() || a.y() != b.y())
            differ();
    }

    // Pointers

    template <class T>
    void same(T* a, T* b)
    {
        if (!a && !b)
            return;
        if (!a || !b || typeid(*a) != typeid(*b))
            return differ();
        const void* const first = dynamic_cast<const void*>(a);
        const void* const second = dynamic_cast<const void*>(b);
        const auto known = m_partners.find(first);
        if (known != m_partners.end()) {
            if (known->second != second)
                differ();
            return;
        }
        if (!m_loaded.insert(second).second)
            return differ();
        m_partners.emplace(first, second);
        self().same(*a, *b);
    }

    // Containers

    template <class V>
    void same(const std::deque<V>& a, const std::deque<V>& b)
    {
        for (std::size_t i = 0; i != std::min(a.size(), b.size()); ++i)
            at("[" + std::to_string(i) + "]", a[i], b[i]);
        if (a.size() != b.size())
            differ();
    }

    template <class A, class B>
    void same(const std::pair<A, B>& a, const std::pair<A, B>& b)
    {
        at("/first", a.first, b.first);
        at("/second", a.second, b.second);
    }

    template <class K, class V>
    void same(const std::map<const K*, V>& a, const std::map<const K*, V>& b)
    {
        std::map<QString, const std::pair<const K* const, V>*> first;
        std::map<QString, const std::pair<const K* const, V>*> second;
        for (const auto& entry : a)
            first.emplace(self().nameOf(*entry.first), &entry);
        for (const auto& entry : b)
            second.emplace(self().nameOf(*entry.first), &entry);
        eachNamed(first, second, a.size(), b.size(), [&](const auto& one, const auto& other) {
            at("/key", one->first, other->first);
            at("/value", one->second, other->second);
        });
    }

    template <class K>
    void same(const std::set<const K*>& a, const std::set<const K*>& b)
    {
        std::map<QString, const K*> first;
        std::map<QString, const K*> second;
        for (const K* const item : a)
            first.emplace(self().nameOf(*item), item);
        for (const K* const item : b)
            second.emplace(self().nameOf(*item), item);
        eachNamed(first, second, a.size(), b.size(),
                  [&](const K* one, const K* other) { self().same(one, other); });
    }

    template <class Item, class Compare>
    void eachNamed(const std::map<QString, Item>& a, const std::map<QString, Item>& b, std::size_t aSize,
                   std::size_t bSize, Compare compare)
    {
        for (const auto& entry : a) {
            const Place place(*this, "[" + entry.first.toStdString() + "]");
            const auto other = b.find(entry.first);
            if (other == b.end())
                differ();
            else
                compare(entry.second, other->second);
        }
        // As many names as items, or some could not be matched.
        if (a.size() != aSize || b.size() != bSize || aSize != bSize)
            differ();
    }

    // Walking

    Derived& self() { return static_cast<Derived&>(*this); }

    struct Place
    {
        Place(GraphComparison& comparison_, const std::string& step)
            : comparison(comparison_), length(comparison.m_place.size())
        {
            comparison.m_place += step;
        }
        ~Place() { comparison.m_place.resize(length); }
        Place(const Place&) = delete;
        Place& operator=(const Place&) = delete;

        GraphComparison& comparison;
        std::size_t length;
    };

    template <class V>
    void at(const std::string& step, const V& a, const V& b)
    {
        const Place place(*this, step);
        self().same(a, b);
    }

    template <class T, class V, class Class, class... More>
    void fields(const T& a, const T& b, const char* name, V Class::*member, More... more)
    {
        at(std::string("/") + name, a.*member, b.*member);
        if constexpr (sizeof...(more) > 0)
            fields(a, b, more...);
    }

    template <class T, class V, class Class, class... More>
    void defaults(const T& loaded, const char* name, V Class::*member, More... more)
    {
        if (!(loaded.*member == T().*member)) {
            const Place place(*this, std::string("/") + name);
            differ();
        }
        if constexpr (sizeof...(more) > 0)
            defaults(loaded, more...);
    }

    void differ() { m_differences.push_back(m_place.empty() ? "/" : m_place.substr(1)); }

private:
    const bool m_wrapsTimes;
    std::string m_place;
    std::vector<std::string> m_differences;
    std::map<const void*, const void*> m_partners;
    std::set<const void*> m_loaded;
};

} // namespace Testing
