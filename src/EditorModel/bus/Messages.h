// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/PubSub.h>

/// The messages by which views own, watch and change shared objects, and the two bases of all others. A
/// request asks the owner of an object to do something and is lost if there is none; a notification is an
/// owner telling what has happened. Messages own nothing of what they point at.
namespace Message::Types {

template <typename T>
class Request : public PubSub::Message<T>
{
public:
    using PubSub::Message<T>::Message;
};

template <typename T>
class Notification : public PubSub::Message<T>
{
public:
    using PubSub::Message<T>::Message;
};

/// Asks whoever accepts adds to own the object, which is the sender.
template <typename T>
class Add : public Request<T>
{
public:
    Add(const T* about, T* toOwn) : Request<T>(about), object(toOwn) {}

    /// The sender, for writing.
    T* object;
};

/// Asks the owner to give the sender another value. The owner leaves `value` as it is.
template <typename T>
class Change : public Request<T>
{
public:
    Change(const T* about, T* wanted) : Request<T>(about), value(wanted) {}

    T* value;
};

/// Asks the owner to let go of the sender.
template <typename T>
class Remove : public Request<T>
{
public:
    using Request<T>::Request;
};

/// Asks every owner to answer with one Enumerated for each object that it owns. The sender is null.
template <typename T>
class Enumerate : public Request<T>
{
public:
    explicit Enumerate(const T* about = nullptr) : Request<T>(about) {}
};

/// The sender has an owner from now on.
template <typename T>
class Added : public Notification<T>
{
public:
    using Notification<T>::Notification;
};

/// The sender has a new value.
template <typename T>
class Changed : public Notification<T>
{
public:
    Changed(const T* about, const T* before) : Notification<T>(about), old(before) {}

    /// The value before the change; it lives until the publication ends.
    const T* old;
};

/// The sender's owner lets go of it, and whoever watches it is to do so as well.
template <typename T>
class Removed : public Notification<T>
{
public:
    using Notification<T>::Notification;
};

/// The answer to Enumerate: somebody owns the sender.
template <typename T>
class Enumerated : public Notification<T>
{
public:
    using Notification<T>::Notification;
};

} // namespace Message::Types
