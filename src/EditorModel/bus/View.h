// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/Messages.h>

#include <exception>
#include <map>
#include <set>
#include <type_traits>
#include <utility>

namespace Message {

/// The way in which the modules share objects of type T. Through its view a module holds an object (own),
/// watches one that somebody else holds (observe), and asks the holder for a change (add, change, remove).
///
/// To own an object means to answer the requests about it and to be the only one that writes to it. It says
/// nothing of memory: a view never deletes an object, and whoever made it keeps it alive for as long as any
/// view has it. Observers read the owner's object itself.
///
/// T is default-constructible, copyable, assignable and derives virtually from PubSub::Object. A
/// default-constructed T stands for "no value" where an object arrives or departs. Its moves do what its
/// copies do: values are moved where T's move assignment is noexcept, and copied otherwise. So an assignment
/// that leaves part of its object in place must not be noexcept.
///
/// All views of one T belong to one thread. A request has been carried out and announced when the operation
/// returns, and it is lost, silently, if the object has no owner. Callbacks may use this and other views in
/// turn, but must not destroy the view that calls them. What a callback throws passes through the operation,
/// and the steps behind it, the announcement to others among them, are not done. Where null is not given a
/// meaning it is ignored.
template <typename T>
class View
{
public:
    class SetterChain;

    View();
    /// Observes the object, if it is not null. The callbacks of a derived class are not reached from here.
    explicit View(const T* object);
    /// The copy owns and observes what the other does. No callback runs.
    View(const View& other);
    View& operator=(const View&) = delete;
    /// Lets go of all objects and publishes nothing: objects that were owned here have no owner then.
    virtual ~View();

    /// Asks, at the end of the chain, whoever accepts adds to own the object. The chain's setters act on the
    /// object itself. The owner's answer makes this view observe it, now or whenever it comes.
    SetterChain add(T* object);
    /// Owns the object from the end of the chain on. The chain's setters act on the object itself.
    SetterChain own(T* object);
    /// Gives the object, at the end of the chain, the value that the setters made of a copy of it. The object
    /// is to be owned or observed here. Null stands for the first object of the view; if there is none, the
    /// end of the chain adds the chain's own value, whose address is good for nothing afterwards.
    SetterChain change(const T* object);
    /// Ends the sharing of the object. It is to be owned or observed here; null stands for the first one. On
    /// an empty view null reaches nobody.
    void remove(const T* object);
    /// Drops the object here and tells nobody else. Its owner, if it was this view, is not replaced. The
    /// callbacks of a departure run for an object that is unknown here, too.
    void forget(const T* object);
    /// Watches the object, whether or not somebody owns it. One that is here already arrives anew, and is
    /// only observed afterwards if it was owned here.
    void observe(const T* object);
    /// From here on observes every object that anybody adds, also one that is owned here.
    void observeNew();
    void forgetNew();
    /// observeNew(), and observes what is owned by anybody now, in the order of the addresses.
    void observeAll();
    /// From here on owns every object that anybody wants to add. Earlier requests are gone; there is no way
    /// back.
    void processAddRequests();

    /// Owned or observed.
    bool isObserved(const T* object) const;
    bool isOwned(const T* object) const;
    /// The first in the order of addresses; null if there is none.
    const T* object() const;
    std::set<const T*> objects() const;
    /// What any view in the process owns.
    std::set<const T*> enumerateAll();
    /// The object for writing if it is owned here, null if it is only observed, and the argument itself if it
    /// is unknown.
    T* ownerPointer(const T* object);

protected:
    /// The first call on arrival.
    virtual void added(const T* object);
    /// Called on arrival with a default old value, on change, and on departure with a default new value.
    virtual void changed(const T* object, const T* oldValue, const T* newValue);
    /// Called on change alone. The old value ends with the call.
    virtual void changed(const T* object, const T* oldValue);
    /// Called on arrival, change and departure.
    virtual void changed(const T* object);
    /// The last call on departure.
    virtual void removed(const T* object);

    /// The owner's side of a request. A replacement may adjust or refuse it; to grant it, it ends in a call
    /// of the one it replaces. Requests to change or remove an object that was forgotten or is only observed
    /// by now don't get here.
    virtual void addRequested(T* object);
    /// `value` is the owner's to use up: it holds the old value afterwards.
    virtual void changeRequested(T* object, T* value);
    virtual void removeRequested(T* object);

private:
    class Enumerator;

    class Observer : public PubSub::Subscriber<Types::Added<T>, Types::Changed<T>, Types::Removed<T>>
    {
    public:
        class Adder : public PubSub::Subscriber<Types::Added<T>>
        {
        public:
            void notify(const Types::Added<T>& message) override;
            View* view = nullptr;
        };

        void notify(const Types::Added<T>& message) override;
        void notify(const Types::Changed<T>& message) override;
        void notify(const Types::Removed<T>& message) override;
        void setView(View* view);

        Adder adder;

    private:
        View* m_view = nullptr;
    };

    class Owner : public PubSub::Subscriber<Types::Add<T>, Types::Change<T>, Types::Remove<T>>
    {
    public:
        class Adder : public PubSub::Subscriber<Types::Add<T>>
        {
        public:
            void notify(const Types::Add<T>& message) override;
            View* view = nullptr;
        };

        class Enumerator : public PubSub::Subscriber<Types::Enumerate<T>>
        {
        public:
            void notify(const Types::Enumerate<T>& message) override;
            View* view = nullptr;
        };

        void notify(const Types::Add<T>& message) override;
        void notify(const Types::Change<T>& message) override;
        void notify(const Types::Remove<T>& message) override;
        void setView(View* view);

        Adder adder;
        Enumerator enumerator;

    private:
        View* m_view = nullptr;
    };

    void doAdd(T* object, bool own);
    void doChange(const T* object, T* value);
    void doRemove(const T* object);
    T* ownedPtr(const T* object) const;

    void notify(const Types::Add<T>& message);
    void notify(const Types::Added<T>& message);
    void notify(const Types::Change<T>& message);
    void notify(const Types::Changed<T>& message);
    void notify(const Types::Remove<T>& message);
    void notify(const Types::Removed<T>& message);

    void take(T* object);
    void commit(T* object, T* value);
    void announceArrival(const T* object);
    void announceChange(const T* object, const T* old);
    void announceDeparture(const T* object);

    Observer m_observer;
    Owner m_owner;
    /// Owned objects map to themselves, observed ones to null.
    std::map<const T*, T*> m_objects;
};

/// What add, own and change return. It lends the client the value to edit, as in
/// `view.change(task)->setProgress(0.5)->setPaused();`, and carries the operation out when it ends: with the
/// statement, or with the variable that holds it. It must not outlive its view.
///
/// Its destructor lets through what a callback throws. A chain that ends because an exception is passing
/// through does nothing.
template <typename T>
class View<T>::SetterChain
{
public:
    /// The operation goes over to the new chain; the other one does nothing at its end.
    SetterChain(SetterChain&& other) noexcept(std::is_nothrow_move_constructible_v<T>);
    SetterChain& operator=(SetterChain&&) = delete;
    ~SetterChain() noexcept(false);

    T* operator->() const { return m_value; }

private:
    friend class View;
    SetterChain(View* view, T* object, bool own);
    SetterChain(View* view, const T* object);

    View* m_view;
    bool m_active = true;
    bool m_own;
    const T* m_object;
    T* m_value;
    T m_local;
    int m_exceptions = std::uncaught_exceptions();
};

} // namespace Message

#include <EditorModel/bus/detail/ViewBodies.h>
