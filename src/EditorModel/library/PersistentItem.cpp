// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/PersistentItem.h>

#include <EditorModel/persistence/Fields.h>

namespace EditorCollection {

template <class T>
PersistentItem<T>::PersistentItem() = default;

template <class T>
PersistentItem<T>::~PersistentItem() = default;

template <class T>
void fields(Serialize::Fields& f, PersistentItem<T>& item)
{
    f("uniqueId", item.uniqueId)("item", item.item)("preview", item.preview);
    f("categories", item.categories)("collectionId", item.collectionId);
    f("customStrings", item.customStrings);
}

} // namespace EditorCollection

EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(EditorCollection::PersistentItem<Effect::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(EditorCollection::PersistentItem<Import::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(EditorCollection::PersistentItem<Theme::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(EditorCollection::PersistentItem<Transition::Object>)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(EditorCollection::PersistentItem<Overlay::Preset>)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(EditorCollection::PersistentItem<Quiz::Preset>)
EDITORMODEL_PERSISTENT_INSTANTIATION_CLASS(EditorCollection::PersistentItem<Envelope::TransformationPreset>)

template class EditorCollection::PersistentItem<Effect::Object>;
template class EditorCollection::PersistentItem<Import::Object>;
template class EditorCollection::PersistentItem<Theme::Object>;
template class EditorCollection::PersistentItem<Transition::Object>;
template class EditorCollection::PersistentItem<Overlay::Preset>;
template class EditorCollection::PersistentItem<Quiz::Preset>;
template class EditorCollection::PersistentItem<Envelope::TransformationPreset>;
