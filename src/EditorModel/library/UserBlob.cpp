// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/library/UserBlob.h>

namespace UserBlob {

Helper::Helper()
{
    subscribe(this);
}

Helper::Helper(const Helper& other) : Helper()
{
    // A copy constructor that the compiler makes for a derived class brings the other's subscriptions along.
    unsubscribe(&other);
    *this = other;
}

Helper::Helper(Helper&& other) : Helper()
{
    unsubscribe(&other);
    m_createResult = std::move(other.m_createResult);
    m_registeredBlobId2Path = std::move(other.m_registeredBlobId2Path);
}

Helper& Helper::operator=(const Helper& other)
{
    m_createResult = other.m_createResult;
    m_registeredBlobId2Path = other.m_registeredBlobId2Path;
    return *this;
}

Helper::~Helper() = default;

Helper::CreateResult Helper::createLut(const QString& file)
{
    PubSub::publish(Details::CreateLutRequest(this, file));
    return m_createResult;
}

void Helper::loadBlob(const QString& blob)
{
    PubSub::publish(Details::LoadBlobRequest(this, blob));
}

const QMap<QString, QString>& Helper::registeredBlobId2Path() const
{
    PubSub::publish(Details::GetUserBlobsRequest(this));
    return m_registeredBlobId2Path;
}

void Helper::notify(const Details::CreateLutNotification& answer)
{
    m_createResult = *answer.result;
}

void Helper::notify(const Details::GetUserBlobsNotification& answer)
{
    m_registeredBlobId2Path = answer.registeredBlobId2Path;
}

} // namespace UserBlob
