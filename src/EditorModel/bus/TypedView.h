// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/bus/View.h>

/// The body of a typed view base: a class that derives privately from Message::View<T> and gives every
/// operation and callback of it a name with a prefix of its own, so that a module can derive from several of
/// them at once.
///
///     class FileViewBase : private ::Message::View<File>
///     {
///         EDITORMODEL_TYPED_VIEW(File, file)
///     };
///
/// gives derived classes, all protected: file(), files(), fileAdd(), fileOwn(), fileChange(), fileRemove(),
/// fileForget(), fileObserve(), fileIsObserved(), fileIsOwned(), fileOwnerPointer(), and the empty virtual
/// callbacks fileAdded(), fileRemoved() and fileChanged() with three, two and one argument, behind those of
/// View<T> and in this order. Each does what the one of View<T> without the prefix does; View<T>'s own
/// callbacks are overridden here, privately. The rest of View<T> is not handed on.
///
/// A view on top derives from the base, overrides the three-argument fileChanged() and compares the two
/// values; its callbacks are declared behind. A client that overrides one fileChanged() hides the other two:
/// it says `using FileViewBase::fileChanged;` if it wants to call them.
///
/// Type may depend on a template parameter of the class. The macro leaves the class in `private:`. Inside the
/// macro's class and below it, the bare name View means the private base; write ::Message::View<X> in full
/// for another one.
///
/// A base whose T stands in a library is compiled once, if its header has
/// `extern template class YOUR_EXPORT Message::View<T>;`, with your library's export macro, in front of the
/// first class that uses it, and one source has `template class Message::View<T>;`. T must be complete in
/// both places.
#define EDITORMODEL_TYPED_VIEW(Type, prefix)                                                                 \
protected:                                                                                                   \
    const Type* prefix() const                                                                               \
    {                                                                                                        \
        return this->object();                                                                               \
    }                                                                                                        \
    std::set<const Type*> prefix##s() const                                                                  \
    {                                                                                                        \
        return this->objects();                                                                              \
    }                                                                                                        \
    typename ::Message::View<Type>::SetterChain prefix##Add(Type* object)                                    \
    {                                                                                                        \
        return this->add(object);                                                                            \
    }                                                                                                        \
    typename ::Message::View<Type>::SetterChain prefix##Own(Type* object)                                    \
    {                                                                                                        \
        return this->own(object);                                                                            \
    }                                                                                                        \
    typename ::Message::View<Type>::SetterChain prefix##Change(const Type* object)                           \
    {                                                                                                        \
        return this->change(object);                                                                         \
    }                                                                                                        \
    void prefix##Remove(const Type* object)                                                                  \
    {                                                                                                        \
        this->remove(object);                                                                                \
    }                                                                                                        \
    void prefix##Forget(const Type* object)                                                                  \
    {                                                                                                        \
        this->forget(object);                                                                                \
    }                                                                                                        \
    void prefix##Observe(const Type* object)                                                                 \
    {                                                                                                        \
        this->observe(object);                                                                               \
    }                                                                                                        \
    bool prefix##IsObserved(const Type* object) const                                                        \
    {                                                                                                        \
        return this->isObserved(object);                                                                     \
    }                                                                                                        \
    bool prefix##IsOwned(const Type* object) const                                                           \
    {                                                                                                        \
        return this->isOwned(object);                                                                        \
    }                                                                                                        \
    Type* prefix##OwnerPointer(const Type* object)                                                           \
    {                                                                                                        \
        return this->ownerPointer(object);                                                                   \
    }                                                                                                        \
                                                                                                             \
    virtual void prefix##Added(const Type*) {}                                                               \
    virtual void prefix##Removed(const Type*) {}                                                             \
    virtual void prefix##Changed(const Type*, const Type*, const Type*) {}                                   \
    virtual void prefix##Changed(const Type*, const Type*) {}                                                \
    virtual void prefix##Changed(const Type*) {}                                                             \
                                                                                                             \
private:                                                                                                     \
    void added(const Type* object) override                                                                  \
    {                                                                                                        \
        prefix##Added(object);                                                                               \
    }                                                                                                        \
    void changed(const Type* object, const Type* oldValue, const Type* newValue) override                    \
    {                                                                                                        \
        prefix##Changed(object, oldValue, newValue);                                                         \
    }                                                                                                        \
    void changed(const Type* object, const Type* oldValue) override                                          \
    {                                                                                                        \
        prefix##Changed(object, oldValue);                                                                   \
    }                                                                                                        \
    void changed(const Type* object) override                                                                \
    {                                                                                                        \
        prefix##Changed(object);                                                                             \
    }                                                                                                        \
    void removed(const Type* object) override                                                                \
    {                                                                                                        \
        prefix##Removed(object);                                                                             \
    }
