// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/ImportState.h>

namespace Import {

State* State::setImport(const Import::Object* object)
{
    import = object;
    return this;
}

State* State::setDeployError(Package::DeployResult result)
{
    deployError = result;
    return this;
}

State* State::setProgress(double newProgress)
{
    progress = newProgress;
    return this;
}

State* State::setStage(Stage newStage)
{
    stage = newStage;
    return this;
}

void StateAcquier::notify(const Details::AcquireStateNotification& message)
{
    state = message.state;
}

} // namespace Import
