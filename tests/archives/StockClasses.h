// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/types/MTime.h>

#include <QList>
#include <QMap>
#include <QPointF>
#include <QString>

#include <boost/archive/binary_iarchive.hpp>
#include <boost/archive/binary_oarchive.hpp>
#include <boost/archive/xml_iarchive.hpp>
#include <boost/archive/xml_oarchive.hpp>
#include <boost/serialization/base_object.hpp>
#include <boost/serialization/deque.hpp>
#include <boost/serialization/export.hpp>
#include <boost/serialization/level.hpp>
#include <boost/serialization/map.hpp>
#include <boost/serialization/nvp.hpp>
#include <boost/serialization/set.hpp>
#include <boost/serialization/split_free.hpp>
#include <boost/serialization/string.hpp>
#include <boost/serialization/tracking.hpp>
#include <boost/serialization/utility.hpp>

#include <algorithm>
#include <deque>
#include <map>
#include <set>
#include <string>
#include <tuple>
#include <utility>

/// The classes of `Sample` once more, with Boost.Serialization's own templates written by hand: what they
/// store is what the library's archives are held against. Their export keys have another first letter, as
/// both kinds of class live in one process.
namespace Stock {

enum Shade : int
{
    Light = 0,
    Dark = 7,
};

struct Root
{
    virtual ~Root() = default;
    /// Abstract, as `Serialize::ISerializable` is.
    virtual int kind() const = 0;

    template <class Archive>
    void serialize(Archive&, const unsigned int)
    {}
};

struct Leaf : Root
{
    int kind() const override { return 1; }

    Leaf() = default;
    Leaf(int aNumber, const QString& aText) : number(aNumber), text(aText) {}

    int number = 0;
    QString text;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& boost::serialization::make_nvp("number", number);
        ar& boost::serialization::make_nvp("text", text);
    }
};

struct Trunk : virtual Root
{
    int kind() const override { return 2; }

    double girth = 0.0;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& boost::serialization::make_nvp("girth", girth);
    }
};

struct Bark : virtual Root
{
    int kind() const override { return 3; }

    bool rough = false;
    const Bark* next = nullptr;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        ar& boost::serialization::make_nvp("rough", rough);
        ar& boost::serialization::make_nvp("next", next);
    }
};

struct Tree : Trunk, Bark
{
    int kind() const override { return 4; }

    bool flag = false;
    int whole = 0;
    quint32 colour = 0;
    qint64 large = 0;
    double real = 0.0;
    std::string bytes;
    QString text;
    MTime time;
    QPointF point;
    Shade shade = Light;
    QString reversed;
    const Tree* other = nullptr;
    const Leaf* leaf = nullptr;
    const Leaf* sameLeaf = nullptr;
    const Leaf* soft = nullptr;
    const Root* anything = nullptr;
    Leaf inner;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        using boost::serialization::make_nvp;
        // Tags of XML take no ':'.
        constexpr bool xml = std::is_same_v<Archive, boost::archive::xml_oarchive>;
        ar& make_nvp(xml ? "Stock_..Trunk" : "Stock_::Trunk",
                     boost::serialization::base_object<Trunk>(*this));
        ar& make_nvp(xml ? "Stock_..Bark" : "Stock_::Bark", boost::serialization::base_object<Bark>(*this));
        ar& make_nvp("flag", flag);
        ar& make_nvp("whole", whole);
        ar& make_nvp("colour", colour);
        ar& make_nvp("large", large);
        ar& make_nvp("real", real);
        ar& make_nvp("bytes", bytes);
        ar& make_nvp("text", text);
        ar& make_nvp("time", time);
        ar& make_nvp("point", point);
        ar& make_nvp("shade", shade);
        std::string turned = reversed.toStdString();
        std::reverse(turned.begin(), turned.end());
        ar& make_nvp("reversed", turned);
        ar& make_nvp("other", other);
        ar& make_nvp("leaf", leaf);
        ar& make_nvp("sameLeaf", sameLeaf);
        ar& make_nvp("soft", soft);
        ar& make_nvp("anything", anything);
        ar& make_nvp("inner", inner);
    }
};

struct Grove : Root
{
    int kind() const override { return 5; }

    std::deque<const Tree*> row;
    std::deque<int> numbers;
    std::deque<Leaf> litter;
    std::deque<std::deque<QString>> words;
    std::set<const Leaf*> leaves;
    std::map<const Leaf*, MTime> falls;
    std::map<QString, Leaf> named;
    std::map<int, std::map<int, double>> grid;
    std::pair<const Leaf*, const Leaf*> couple;
    std::tuple<QString, int, Shade> triple;
    QMap<QString, QString> notes;
    QList<const Leaf*> list;

    template <class Archive>
    void serialize(Archive& ar, const unsigned int)
    {
        using boost::serialization::make_nvp;
        ar& make_nvp("row", row);
        ar& make_nvp("numbers", numbers);
        ar& make_nvp("litter", litter);
        ar& make_nvp("words", words);
        ar& make_nvp("leaves", leaves);
        ar& make_nvp("falls", falls);
        ar& make_nvp("named", named);
        ar& make_nvp("grid", grid);
        ar& make_nvp("couple", couple);
        ar& make_nvp("triple", triple);
        ar& make_nvp("notes", notes);
        ar& make_nvp("list", list);
    }
};

} // namespace Stock

BOOST_CLASS_EXPORT_KEY2(Stock::Leaf, "Stock_::Leaf")
BOOST_CLASS_EXPORT_KEY2(Stock::Trunk, "Stock_::Trunk")
BOOST_CLASS_EXPORT_KEY2(Stock::Bark, "Stock_::Bark")
BOOST_CLASS_EXPORT_KEY2(Stock::Tree, "Stock_::Tree")
BOOST_CLASS_EXPORT_KEY2(Stock::Grove, "Stock_::Grove")

/// Values: no class information, never tracked, a nameless pair around the primitive.
#define STOCK_VALUE(Class)                                                                                   \
    BOOST_CLASS_IMPLEMENTATION(Class, boost::serialization::object_serializable)                             \
    BOOST_CLASS_TRACKING(Class, boost::serialization::track_never)

STOCK_VALUE(QString)
STOCK_VALUE(MTime)
STOCK_VALUE(QPointF)

namespace boost::serialization {

template <class Archive>
void serialize(Archive& ar, QString& text, const unsigned int)
{
    std::string utf8 = text.toStdString();
    ar& make_nvp(nullptr, utf8);
    text = QString::fromStdString(utf8);
}

template <class Archive>
void serialize(Archive& ar, MTime& time, const unsigned int)
{
    int low = static_cast<int>(time.ms());
    ar& make_nvp(nullptr, low);
    time = MTime(low);
}

template <class Archive>
void serialize(Archive& ar, QPointF& point, const unsigned int)
{
    ar& make_nvp("x", point.rx());
    ar& make_nvp("y", point.ry());
}

template <class Archive, class... Elements>
void serialize(Archive& ar, std::tuple<Elements...>& tuple, const unsigned int)
{
    std::apply([&](auto&... element) { ((ar & make_nvp("element", element)), ...); }, tuple);
}

template <class Archive>
void serialize(Archive& ar, QMap<QString, QString>& map, const unsigned int)
{
    int count = map.size();
    ar& make_nvp("count", count);
    for (auto entry = map.begin(); entry != map.end(); ++entry) {
        std::pair<const QString, QString> item(entry.key(), entry.value());
        ar& make_nvp("item", item);
    }
}

template <class Archive, class T>
void serialize(Archive& ar, QList<T>& list, const unsigned int)
{
    int count = list.size();
    ar& make_nvp("count", count);
    for (T& item : list)
        ar& make_nvp("item", item);
}

} // namespace boost::serialization
