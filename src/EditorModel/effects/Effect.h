// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

#include <QString>

namespace Serialize {
class Fields;
}

namespace Effect {

/// Which effect of the engine is meant, and how it is applied. Clips hold chains of them, in order; the
/// processing is the engine's.
///
/// A module may derive from it and replace the four queries. A derived class with an archive name of its own
/// needs no field list: it is written with the fields of this one, which it names as its persistent base.
class EDITORMODEL_EXPORT Object : public virtual Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Object)

public:
    enum Type : int
    {
        Video = 0,
        Audio = 1,
    };

    /// Who carries the effect out; the other values belong to the modules that derive from this class.
    enum Impl : int
    {
        DefaultImpl = 1,
    };

    /// "x-application/VideoEffectObject-serialized", for the clipboard and for drag and drop.
    static const QString* const videoMimeType;
    /// "x-application/AudioEffectObject-serialized".
    static const QString* const audioMimeType;
    /// Null for a type that is neither of the two.
    static const QString* mimeType(Type type);

    /// Of the effect, as the engine knows it.
    QString id;
    /// Tells effects with one `id` apart, as in Timeline::Clip::replaceEffect().
    QString uniqueId;
    /// The name in the library.
    QString tag;
    QString description;
    /// The range is the effect's own.
    double intensity = 1.0;
    /// The effect stays in its chain and does nothing.
    bool bypass = false;

    Object(const QString& id_ = QString(), const QString& uniqueId_ = QString());

    /// Video here.
    virtual Type type() const;
    /// DefaultImpl here.
    virtual Impl impl() const;
    /// Whether `intensity` means anything to the effect; false here.
    virtual bool hasIntensity() const;
    /// Empty here.
    virtual QString defaultTag() const;

    Object* setTag(const QString& newTag);
    Object* setDescription(const QString& newDescription);
    Object* setBypass(bool on);
};

/// The field list, which registered derived classes share.
EDITORMODEL_EXPORT void fields(Serialize::Fields& f, Object& effect);

} // namespace Effect

EDITORMODEL_ARCHIVE_NAME(Effect::Object, "Effect::Object")
