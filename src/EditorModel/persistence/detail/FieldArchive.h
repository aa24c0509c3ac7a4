// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/persistence/Fields.h>

#include <boost/archive/archive_exception.hpp>
#include <boost/mpl/bool.hpp>
#include <boost/serialization/collection_size_type.hpp>
#include <boost/serialization/item_version_type.hpp>
#include <boost/serialization/library_version_type.hpp>
#include <boost/serialization/nvp.hpp>
#include <boost/serialization/serialization.hpp>
#include <boost/serialization/version.hpp>

#include <stdexcept>
#include <string>

namespace Serialize::Details {

/// What a visitor of field lists takes as one field, all the way down.
template <class T, class = void>
struct IsField : std::bool_constant<isPersistent<T>>
{};
template <class T>
struct IsField<T, ScalarField<T>> : std::true_type
{};
template <class T>
struct IsField<T, std::enable_if_t<std::is_enum_v<T>>> : std::true_type
{};
template <class T>
struct IsField<T*> : std::is_base_of<ISerializable, std::remove_cv_t<T>>
{};
template <class T>
struct IsField<std::deque<T>> : IsField<T>
{};
template <class T>
struct IsField<QList<T>> : IsField<T>
{};
template <class T, class Less>
struct IsField<std::set<T, Less>> : IsField<T>
{};
template <class K, class V, class Less>
struct IsField<std::map<K, V, Less>> : std::conjunction<IsField<K>, IsField<V>>
{};
template <class First, class Second>
struct IsField<std::pair<First, Second>>
    : std::conjunction<IsField<std::remove_const_t<First>>, IsField<Second>>
{};
template <class... Elements>
struct IsField<std::tuple<Elements...>> : std::conjunction<IsField<Elements>...>
{};
template <>
struct IsField<QMap<QString, QString>> : std::true_type
{};

/// The face that an archive of our own shows to Boost's serialization bodies. Everything that a field list
/// can hold goes to the archive's visitor; a class with a body of its own is asked for its body.
///
/// `Archive` has `Fields& fields()`, `void begin(const char* key)`, `void end(const char* key)` around a
/// value with a key, and `void number(qint64&)` and `void number(double&)` for numbers that are no fields.
template <class Archive, bool Saving>
class FieldArchive
{
public:
    using is_saving = boost::mpl::bool_<Saving>;
    using is_loading = boost::mpl::bool_<!Saving>;

    template <class T>
    Archive& operator&(const T& value)
    {
        transfer(nullptr, const_cast<T&>(value));
        return self();
    }

    /// Classes are known by their names alone.
    template <class T>
    void register_type(const T* = nullptr)
    {}

    boost::serialization::library_version_type get_library_version() const
    {
        return boost::serialization::library_version_type(libraryVersion);
    }
    unsigned int get_flags() const { return 0; }
    /// Nothing that is read moves afterwards: items are read where they stand.
    void reset_object_address(const void*, const void*) {}

protected:
    ~FieldArchive() = default;

    template <class T>
    void transfer(const char* key, boost::serialization::nvp<T>& pair)
    {
        transfer(pair.name() ? pair.name() : key, const_cast<std::remove_const_t<T>&>(pair.const_value()));
    }

    void transfer(const char* key, boost::serialization::collection_size_type& size)
    {
        auto number = static_cast<qint64>(std::size_t(size));
        numberUnder(key, number);
        if (number < 0)
            throw std::runtime_error("a count of " + std::to_string(number) + " items");
        // A body makes room for what is counted before it reads any of it.
        self().checkCount(static_cast<std::size_t>(number));
        size = boost::serialization::collection_size_type(static_cast<std::size_t>(number));
    }

    void transfer(const char* key, boost::serialization::item_version_type& version)
    {
        auto number = static_cast<qint64>(static_cast<unsigned int>(version));
        numberUnder(key, number);
        version = boost::serialization::item_version_type(static_cast<unsigned int>(number));
    }

    template <class T>
    void transfer(const char* key, T& value)
    {
        if constexpr (IsField<T>::value) {
            self().fields()(Key(key), value);
        } else if constexpr (std::is_arithmetic_v<T>) {
            std::conditional_t<std::is_floating_point_v<T>, double, qint64> number =
                static_cast<decltype(number)>(value);
            requireSame(value, number);
            numberUnder(key, number);
            if constexpr (is_loading::value) {
                value = static_cast<T>(number);
                requireSame(value, number);
            }
        } else {
            static_assert(std::is_class_v<T>, "only persistent classes go through pointers");
            within(key, [&] {
                boost::serialization::serialize_adl(self(), value, boost::serialization::version<T>::value);
            });
        }
    }

private:
    static constexpr unsigned int libraryVersion = 18;

    Archive& self() { return static_cast<Archive&>(*this); }

    template <class Number>
    void numberUnder(const char* key, Number& number)
    {
        within(key, [&] { self().number(number); });
    }

    template <class Body>
    void within(const char* key, Body body)
    {
        self().begin(key);
        try {
            body();
        } catch (...) {
            self().abandon(key);
            throw;
        }
        self().end(key);
    }

    /// A number that does not fit its other type is refused rather than cut.
    template <class T, class Number>
    static void requireSame(T value, Number number)
    {
        if constexpr (std::is_integral_v<T>) {
            if (static_cast<Number>(value) != number || (value < T(0)) != (number < 0))
                throw std::runtime_error("the number " + std::to_string(number) + " is out of range");
        }
    }
};

} // namespace Serialize::Details
