// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>
#include <EditorModel/effects/Effect.h>

#include <deque>

namespace Effect {

/// A chain of effects, none of them owned.
using List = std::deque<const Object*>;

namespace Details {

// The requests of EffectHelper. Their sender is null: whoever answers them subscribes to all of
// Effect::Object. The lists live only until the publication ends.

class EDITORMODEL_EXPORT EffectListModificationRequest : public ::Message::Types::Request<Effect::Object>
{
public:
    EffectListModificationRequest(const Effect::Object* about, List& toChange)
        : Request(about), list(toChange)
    {}

    /// To be changed in place.
    List& list;
};

class EDITORMODEL_EXPORT SortRequest : public EffectListModificationRequest
{
public:
    using EffectListModificationRequest::EffectListModificationRequest;
};

/// Asks to replace the effects that hold others by what they hold.
class EDITORMODEL_EXPORT ExpandEffectsHoldersRequest : public EffectListModificationRequest
{
public:
    using EffectListModificationRequest::EffectListModificationRequest;
};

/// Asks to move what the request names from `list` to `result`.
class EDITORMODEL_EXPORT EffectListFilterRequest : public EffectListModificationRequest
{
public:
    EffectListFilterRequest(const Effect::Object* about, List& toChange, List& removed)
        : EffectListModificationRequest(about, toChange), result(removed)
    {}

    List& result;
};

/// Picture-in-picture effects.
class EDITORMODEL_EXPORT RemoveAllPiPEffectsRequest : public EffectListFilterRequest
{
public:
    using EffectListFilterRequest::EffectListFilterRequest;
};

class EDITORMODEL_EXPORT RemoveAllStaticEffectsRequest : public EffectListFilterRequest
{
public:
    using EffectListFilterRequest::EffectListFilterRequest;
};

class EDITORMODEL_EXPORT RemoveCropTransposeEffectsRequest : public EffectListFilterRequest
{
public:
    using EffectListFilterRequest::EffectListFilterRequest;
};

class EDITORMODEL_EXPORT RemoveNormalizeEffectsRequest : public EffectListFilterRequest
{
public:
    using EffectListFilterRequest::EffectListFilterRequest;
};

class EDITORMODEL_EXPORT RemovePreTransformEffectsRequest : public EffectListFilterRequest
{
public:
    using EffectListFilterRequest::EffectListFilterRequest;
};

} // namespace Details

/// List operations that the module which knows the concrete effects carries out, before the call returns.
/// Without such a module lists stay as they are. What is removed is returned, in the order in which the
/// module took it out.
class EDITORMODEL_EXPORT EffectHelper
{
public:
    static void sortEffects(List& list);
    /// Replaces the effects that hold others by what they hold.
    static void expandEffectsHolders(List& list);
    /// Picture-in-picture effects.
    static List removeAllPiPEffects(List& list);
    static List removeAllStaticEffects(List& list);
    static List removeAudioNormalizeEffects(List& list);
    static List removeCropTransposeEffects(List& list);
    static List removePreTransformEffects(List& list);
};

} // namespace Effect
