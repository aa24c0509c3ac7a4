// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>
#include <EditorModel/library/DeployResult.h>

namespace Import {

class Object;

/// How far the fetching of an item has got. It lives at run time only, with the module that fetches.
class EDITORMODEL_EXPORT State : public virtual PubSub::Object
{
public:
    /// What StateView does in a stage; the meaning of the stages belongs to the module that fetches. Other
    /// values are reached by a cast.
    enum Stage : int
    {
        Initial = 2,      ///< can be imported; a cancelled import comes back to it
        Requested = 3,    ///< an import was asked for; can be cancelled
        Cancellable4 = 4, ///< can be cancelled
        Cancellable5 = 5, ///< can be cancelled
        Importable7 = 7,  ///< can be imported
    };

    /// The item. Not owned.
    const Import::Object* import = nullptr;
    Package::DeployResult deployError = Package::DefaultDeployResult;
    /// Stored as it is given; the scale is that of the module that fetches.
    double progress = 0.0;
    Stage stage = Initial;

    State* setImport(const Import::Object* object);
    State* setDeployError(Package::DeployResult result);
    State* setProgress(double newProgress);
    State* setStage(Stage newStage);
};

namespace Details {

/// A private address for one question and its answer.
class EDITORMODEL_EXPORT AcquireSubscription : public virtual PubSub::Object
{};

/// Asks for the state of an item, which is to be kept from then on. Whoever owns the states answers, before
/// the publication ends, by an AcquireStateNotification with the same sender. Every such request is to be
/// answered.
class EDITORMODEL_EXPORT AcquireState : public ::Message::Types::Request<AcquireSubscription>
{
public:
    AcquireState(const AcquireSubscription* about, const Import::Object* item) : Request(about), object(item)
    {}

    const Import::Object* object;
};

/// Tells that the sender's side has no more use for the state of an item.
class EDITORMODEL_EXPORT ReleaseState : public ::Message::Types::Request<AcquireSubscription>
{
public:
    ReleaseState(const AcquireSubscription* about, const Import::Object* item) : Request(about), object(item)
    {}

    const Import::Object* object;
};

/// Tells whoever has asked which state is that of the item. It stays with whoever owns the states.
class EDITORMODEL_EXPORT AcquireStateNotification : public ::Message::Types::Notification<AcquireSubscription>
{
public:
    AcquireStateNotification(const AcquireSubscription* about, const Import::State* answer)
        : Notification(about), state(answer)
    {}

    const Import::State* state;
};

} // namespace Details

/// Holds the state that an owner of states has answered with; of several answers, the last one.
class EDITORMODEL_EXPORT StateAcquier : public PubSub::Subscriber<Details::AcquireStateNotification>
{
public:
    void notify(const Details::AcquireStateNotification& message) override;

    /// Null as long as nobody has answered.
    const Import::State* state = nullptr;
};

} // namespace Import
