// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Preview.h>
#include <EditorModel/library/ImportObject.h>
#include <EditorModel/library/ImportState.h>

#include <map>

extern template class EDITORMODEL_EXPORT Message::View<Import::Object>;
extern template class EDITORMODEL_EXPORT Message::View<Import::State>;

extern template class EDITORMODEL_EXPORT Preview::Details::ObjectViewBase<Import::Object>;

namespace Import {

namespace Details {

class EDITORMODEL_EXPORT StateViewBase : private ::Message::View<Import::State>
{
    EDITORMODEL_TYPED_VIEW(Import::State, importState)
};

} // namespace Details

/// Starts, cancels and watches imports.
class EDITORMODEL_EXPORT StateView : public Details::StateViewBase
{
protected:
    /// The state of the item, which the view observes from then on. Whoever owns the states is asked for one
    /// that is not known here; null if nobody answers. An owner that asks itself for a state which it makes
    /// only then ends up observing it.
    const State* importStateOf(const Import::Object* object);

    /// Asks the owner of the state to fetch the item. Nothing happens in a stage other than Initial and
    /// Importable7, nor where the item has no state. The state is not null.
    void import(const Import::Object* object);
    void import(const State* state);

    /// Asks the owner of the state to give the fetching up. Nothing happens in a stage other than Requested,
    /// Cancellable4 and Cancellable5, nor where the item has no state. The state is not null.
    void cancelImport(const Import::Object* object);
    void cancelImport(const State* state);

    /// Tells the owner of the states that this view has no more use for the one of the item. The view goes
    /// on to know it until the owner removes it.
    void releaseImportState(const Import::Object* object);

    using Details::StateViewBase::importStateChanged;
    /// Keeps account of which state is whose; a replacement goes on to this one.
    void importStateChanged(const State* state, const State* before, const State* after) override;

private:
    std::map<const Import::Object*, const State*> m_object2state;
};

} // namespace Import
