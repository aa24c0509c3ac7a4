// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/analysis/ClipSynchronization.h>

namespace ClipSynchronization {
namespace {

/// Asks in the name of an object of its own, so that only answers to its question reach it.
class Question : private PubSub::Subscriber<Details::InputDataCheckNotification>
{
public:
    Question() { subscribe(&m_sender); }

    bool ask(const std::set<const Timeline::Clip*>& clips)
    {
        PubSub::publish(Details::InputDataCheckRequest(&m_sender, &clips));
        return m_result;
    }

private:
    void notify(const Details::InputDataCheckNotification& answer) override { m_result = answer.result; }

    const Object m_sender;
    bool m_result = false;
};

} // namespace

Object::~Object() = default;

bool canSynchronize(const std::set<const Timeline::Clip*>& clips)
{
    return Question().ask(clips);
}

} // namespace ClipSynchronization
