// SPDX-License-Identifier: Apache-2.0
#pragma once

// The bodies of Message::View<T>; part of EditorModel/bus/View.h.

#include <EditorModel/bus/View.h>

namespace Message {

namespace Details {

/// Moving cannot fail half-way and leave an owner's object without its contents.
template <typename T>
constexpr bool isMovedSafely = std::is_nothrow_move_assignable_v<T>;

/// What replaceValue() can put the old value of the object into. May throw, and touches nothing.
template <typename T>
T placeForOldValue(const T& object)
{
    if constexpr (isMovedSafely<T>) {
        return T();
    } else {
        return T(object);
    }
}

/// Gives the object the value, and `old`, which is from placeForOldValue(), what the object was.
template <typename T>
void replaceValue(T& object, T& value, T& old)
{
    if constexpr (isMovedSafely<T>) {
        old = std::move(object);
        object = std::move(value);
    } else {
        object = std::as_const(value);
    }
}

/// Assigns the value, which is good for nothing afterwards.
template <typename T>
void assignLast(T& object, T& value)
{
    if constexpr (isMovedSafely<T>) {
        object = std::move(value);
    } else {
        object = std::as_const(value);
    }
}

} // namespace Details

// Construction and end

template <typename T>
View<T>::View()
{
    m_observer.setView(this);
    m_owner.setView(this);
    m_owner.enumerator.template subscribeAll<T>();
}

template <typename T>
View<T>::View(const T* object) : View()
{
    observe(object);
}

template <typename T>
View<T>::View(const View& other)
    : m_observer(other.m_observer), m_owner(other.m_owner), m_objects(other.m_objects)
{
    m_observer.setView(this);
    m_owner.setView(this);
}

/// What forget() does for every object comes about by itself: the callbacks of a derived class are out of
/// reach here, and the subscribers leave the bus when they end. So the objects aren't touched and may have
/// ended before.
template <typename T>
View<T>::~View() = default;

// The client's operations

template <typename T>
typename View<T>::SetterChain View<T>::add(T* object)
{
    return SetterChain(this, object, false);
}

template <typename T>
typename View<T>::SetterChain View<T>::own(T* object)
{
    return SetterChain(this, object, true);
}

template <typename T>
typename View<T>::SetterChain View<T>::change(const T* object)
{
    return SetterChain(this, object ? object : this->object());
}

template <typename T>
void View<T>::remove(const T* object)
{
    doRemove(object ? object : this->object());
}

template <typename T>
void View<T>::forget(const T* object)
{
    if (!object) {
        return;
    }
    m_objects.erase(object);
    m_observer.unsubscribe(object);
    announceDeparture(object);
}

template <typename T>
void View<T>::observe(const T* object)
{
    if (!object) {
        return;
    }
    m_objects[object] = nullptr;
    m_observer.subscribe(object);
    announceArrival(object);
}

template <typename T>
void View<T>::observeNew()
{
    m_observer.adder.template subscribeAll<T>();
}

template <typename T>
void View<T>::forgetNew()
{
    m_observer.adder.template unsubscribeAll<T>();
}

template <typename T>
void View<T>::observeAll()
{
    observeNew();
    for (const T* object : enumerateAll()) {
        observe(object);
    }
}

template <typename T>
void View<T>::processAddRequests()
{
    m_owner.adder.template subscribeAll<T>();
}

template <typename T>
bool View<T>::isObserved(const T* object) const
{
    return m_objects.find(object) != m_objects.end();
}

template <typename T>
bool View<T>::isOwned(const T* object) const
{
    return ownedPtr(object) != nullptr;
}

template <typename T>
const T* View<T>::object() const
{
    return m_objects.empty() ? nullptr : m_objects.begin()->first;
}

template <typename T>
std::set<const T*> View<T>::objects() const
{
    std::set<const T*> keys;
    for (const auto& entry : m_objects) {
        keys.insert(keys.end(), entry.first);
    }
    return keys;
}

template <typename T>
T* View<T>::ownerPointer(const T* object)
{
    return isObserved(object) ? ownedPtr(object) : const_cast<T*>(object);
}

/// Null also for an object that is not in the table.
template <typename T>
T* View<T>::ownedPtr(const T* object) const
{
    const auto found = m_objects.find(object);
    return found == m_objects.end() ? nullptr : found->second;
}

// Callbacks

template <typename T>
void View<T>::added(const T*)
{}

template <typename T>
void View<T>::changed(const T*, const T*, const T*)
{}

template <typename T>
void View<T>::changed(const T*, const T*)
{}

template <typename T>
void View<T>::changed(const T*)
{}

template <typename T>
void View<T>::removed(const T*)
{}

template <typename T>
void View<T>::announceArrival(const T* object)
{
    const T none{};
    added(object);
    changed(object, &none, object);
    changed(object);
}

template <typename T>
void View<T>::announceChange(const T* object, const T* old)
{
    changed(object, old, object);
    changed(object, old);
    changed(object);
}

template <typename T>
void View<T>::announceDeparture(const T* object)
{
    const T none{};
    changed(object, object, &none);
    changed(object);
    removed(object);
}

// What the end of a chain or a remove() does

template <typename T>
void View<T>::doAdd(T* object, bool own)
{
    if (!object) {
        return;
    }
    if (own) {
        take(object);
        return;
    }
    m_observer.subscribe(object);
    PubSub::publish(Types::Add<T>(object, object));
}

template <typename T>
void View<T>::doChange(const T* object, T* value)
{
    T* owned = ownedPtr(object);
    if (!owned) {
        PubSub::publish(Types::Change<T>(object, value));
        return;
    }
    commit(owned, value);
}

template <typename T>
void View<T>::doRemove(const T* object)
{
    T* owned = ownedPtr(object);
    if (!owned) {
        PubSub::publish(Types::Remove<T>(object));
        return;
    }
    // Every observer lets go before the owner's own callbacks run.
    PubSub::publish(Types::Removed<T>(object));
    m_owner.unsubscribe(object);
    announceDeparture(owned);
    m_objects.erase(object);
}

// The owner's side

template <typename T>
void View<T>::addRequested(T* object)
{
    take(object);
}

template <typename T>
void View<T>::changeRequested(T* object, T* value)
{
    T old = Details::placeForOldValue(*object);
    Details::replaceValue(*object, *value, old);
    Details::assignLast(*value, old);
    announceChange(object, value);
    PubSub::publish(Types::Changed<T>(object, value));
}

/// Unlike in doRemove() the subscription outlives the callbacks.
template <typename T>
void View<T>::removeRequested(T* object)
{
    PubSub::publish(Types::Removed<T>(object));
    announceDeparture(object);
    m_objects.erase(object);
    m_owner.unsubscribe(object);
}

template <typename T>
void View<T>::take(T* object)
{
    if (!object) {
        return;
    }
    m_objects[object] = object;
    announceArrival(object);
    m_owner.subscribe(object);
    PubSub::publish(Types::Added<T>(object));
}

/// Leaves a default-constructed T in `value`. All that a T of safe moves can fail to construct is there
/// before the object is touched.
template <typename T>
void View<T>::commit(T* object, T* value)
{
    T none{};
    T old = Details::placeForOldValue(*object);
    Details::replaceValue(*object, *value, old);
    Details::assignLast(*value, none);
    announceChange(object, &old);
    PubSub::publish(Types::Changed<T>(object, &old));
}

// Receipt of messages

template <typename T>
void View<T>::notify(const Types::Add<T>& message)
{
    if (message.object) {
        addRequested(message.object);
    }
}

template <typename T>
void View<T>::notify(const Types::Added<T>& message)
{
    if (!message.sender) {
        return;
    }
    m_observer.subscribe(message.sender);
    m_objects[message.sender] = nullptr;
    announceArrival(message.sender);
}

template <typename T>
void View<T>::notify(const Types::Change<T>& message)
{
    // Null once the object was forgotten or has become an observed one: the subscription outlives both.
    T* owned = ownedPtr(message.sender);
    if (owned) {
        T value(*message.value);
        changeRequested(owned, &value);
    }
}

template <typename T>
void View<T>::notify(const Types::Changed<T>& message)
{
    announceChange(message.sender, message.old);
}

template <typename T>
void View<T>::notify(const Types::Remove<T>& message)
{
    T* owned = ownedPtr(message.sender);
    if (owned) {
        removeRequested(owned);
    }
}

template <typename T>
void View<T>::notify(const Types::Removed<T>& message)
{
    announceDeparture(message.sender);
    m_objects.erase(message.sender);
    m_observer.unsubscribe(message.sender);
}

template <typename T>
void View<T>::Observer::notify(const Types::Added<T>& message)
{
    m_view->notify(message);
}

template <typename T>
void View<T>::Observer::notify(const Types::Changed<T>& message)
{
    m_view->notify(message);
}

template <typename T>
void View<T>::Observer::notify(const Types::Removed<T>& message)
{
    m_view->notify(message);
}

template <typename T>
void View<T>::Observer::setView(View* view)
{
    m_view = view;
    adder.view = view;
}

template <typename T>
void View<T>::Observer::Adder::notify(const Types::Added<T>& message)
{
    if (!view->m_observer.isSubscribed(message.sender)) {
        view->notify(message);
    }
}

template <typename T>
void View<T>::Owner::notify(const Types::Add<T>& message)
{
    m_view->notify(message);
}

template <typename T>
void View<T>::Owner::notify(const Types::Change<T>& message)
{
    m_view->notify(message);
}

template <typename T>
void View<T>::Owner::notify(const Types::Remove<T>& message)
{
    m_view->notify(message);
}

template <typename T>
void View<T>::Owner::setView(View* view)
{
    m_view = view;
    adder.view = view;
    enumerator.view = view;
}

template <typename T>
void View<T>::Owner::Adder::notify(const Types::Add<T>& message)
{
    if (!view->m_owner.isSubscribed(message.object)) {
        view->notify(message);
    }
}

template <typename T>
void View<T>::Owner::Enumerator::notify(const Types::Enumerate<T>&)
{
    // An answer may reach somebody who changes the table.
    const auto& objects = view->m_objects;
    for (auto entry = objects.begin(); entry != objects.end();) {
        const T* object = entry->first;
        if (entry->second) {
            PubSub::publish(Types::Enumerated<T>(object));
        }
        entry = objects.upper_bound(object);
    }
}

// The asking side of enumerateAll()

/// Has all answers when its constructor is done.
template <typename T>
class View<T>::Enumerator : public PubSub::Subscriber<Types::Enumerated<T>>
{
public:
    Enumerator()
    {
        this->template subscribeAll<T>();
        PubSub::publish(Types::Enumerate<T>());
    }

    void notify(const Types::Enumerated<T>& message) override { objects.insert(message.sender); }

    std::set<const T*> objects;
};

template <typename T>
std::set<const T*> View<T>::enumerateAll()
{
    Enumerator answers;
    return std::move(answers.objects);
}

// SetterChain

template <typename T>
View<T>::SetterChain::SetterChain(View* view, T* object, bool own)
    : m_view(view), m_own(own), m_object(nullptr), m_value(object), m_local()
{}

template <typename T>
View<T>::SetterChain::SetterChain(View* view, const T* object)
    : m_view(view), m_own(false), m_object(object), m_value(&m_local), m_local(object ? T(*object) : T())
{}

template <typename T>
View<T>::SetterChain::SetterChain(SetterChain&& other) noexcept(std::is_nothrow_move_constructible_v<T>)
    : m_view(other.m_view),
      m_active(std::exchange(other.m_active, false)),
      m_own(other.m_own),
      m_object(other.m_object),
      m_value(other.m_value == &other.m_local ? &m_local : other.m_value),
      m_local(std::move(other.m_local))
{}

template <typename T>
View<T>::SetterChain::~SetterChain() noexcept(false)
{
    if (!m_active || std::uncaught_exceptions() > m_exceptions) {
        return;
    }
    if (m_object) {
        m_view->doChange(m_object, m_value);
    } else {
        m_view->doAdd(m_value, m_own);
    }
}

} // namespace Message
