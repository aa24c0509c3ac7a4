// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/effects/Effect.h>
#include <EditorModel/effects/Overlay.h>
#include <EditorModel/effects/Quiz.h>
#include <EditorModel/effects/Theme.h>
#include <EditorModel/effects/TransformationPreset.h>
#include <EditorModel/effects/Transition.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/persistence/Persistent.h>
#include <EditorModel/types/Image.h>

#include <QString>

#include <map>
#include <memory>
#include <set>

// The elements are included, not just declared: an instantiation is exported only where its argument is known
// to be.

namespace EditorCollection {

/// What a user collection stores for one element: the element with what is needed to show it. There are seven
/// of them; see below.
template <class T>
class EDITORMODEL_EXPORT PersistentItem : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(PersistentItem)

public:
    /// As Types::nextUniqueId() gives them.
    QString uniqueId;
    /// Not owned; may be null. Whoever loads an item owns the element that came with it.
    T* item = nullptr;
    /// What the collection shows; may be null.
    std::shared_ptr<const Types::Image> preview;
    /// The categories under which the item is listed.
    std::set<QString> categories;
    /// The collection that the item is in, one of CollectionID.
    QString collectionId;
    /// For the owner of the collection to use as it likes.
    std::map<QString, QString> customStrings;

    PersistentItem();
    PersistentItem(const PersistentItem&) = default;
    PersistentItem& operator=(const PersistentItem&) = default;
    ~PersistentItem() override;
};

} // namespace EditorCollection

EDITORMODEL_ARCHIVE_NAME(EditorCollection::PersistentItem<Effect::Object>,
                         "Collection::PersistentItem::Effect::Object")
EDITORMODEL_ARCHIVE_NAME(EditorCollection::PersistentItem<Import::Object>,
                         "Collection::PersistentItem::Import::Object")
EDITORMODEL_ARCHIVE_NAME(EditorCollection::PersistentItem<Theme::Object>,
                         "Collection::PersistentItem::Theme::Object")
EDITORMODEL_ARCHIVE_NAME(EditorCollection::PersistentItem<Transition::Object>,
                         "Collection::PersistentItem::Transition::Object")
EDITORMODEL_ARCHIVE_NAME(EditorCollection::PersistentItem<Overlay::Preset>,
                         "Collection::PersistentItem::Overlay::Preset")
EDITORMODEL_ARCHIVE_NAME(EditorCollection::PersistentItem<Quiz::Preset>,
                         "Collection::PersistentItem::Quiz::Preset")
EDITORMODEL_ARCHIVE_NAME(EditorCollection::PersistentItem<Envelope::TransformationPreset>,
                         "Collection::PersistentItem::Envelope::TransformationPreset")

EDITORMODEL_PERSISTENT_INSTANTIATION(EditorCollection::PersistentItem<Effect::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION(EditorCollection::PersistentItem<Import::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION(EditorCollection::PersistentItem<Theme::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION(EditorCollection::PersistentItem<Transition::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION(EditorCollection::PersistentItem<Overlay::Preset>)
EDITORMODEL_PERSISTENT_INSTANTIATION(EditorCollection::PersistentItem<Quiz::Preset>)
EDITORMODEL_PERSISTENT_INSTANTIATION(EditorCollection::PersistentItem<Envelope::TransformationPreset>)

extern template class EditorCollection::PersistentItem<Effect::Object>;
extern template class EditorCollection::PersistentItem<Import::Object>;
extern template class EditorCollection::PersistentItem<Theme::Object>;
extern template class EditorCollection::PersistentItem<Transition::Object>;
extern template class EditorCollection::PersistentItem<Overlay::Preset>;
extern template class EditorCollection::PersistentItem<Quiz::Preset>;
extern template class EditorCollection::PersistentItem<Envelope::TransformationPreset>;
