// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/Messages.h>

#include <QMap>
#include <QString>

#include <utility>

/// Files that the user has given to the editor for its own use, above all colour look-up tables. A module
/// outside the model keeps them and answers, within the call.
namespace UserBlob {

namespace Details {

/// The address to which answers come. It holds nothing: its identity is its use.
class EDITORMODEL_EXPORT Object : public virtual PubSub::Object
{};

class CreateLutNotification;
class GetUserBlobsNotification;

} // namespace Details

/// Asks the keeper of the blobs, and hears only the answers to its own questions; of several answers to one
/// question the last one counts. It belongs to one thread.
///
/// A copy has the answers that the other has had, and asks in its own name. An assignment takes over the
/// answers, and each goes on to ask in its own name.
class EDITORMODEL_EXPORT Helper
    : public Details::Object,
      public PubSub::Subscriber<Details::CreateLutNotification, Details::GetUserBlobsNotification>
{
public:
    /// What became of a table. The members belong to the keeper, and are passed on unread.
    struct CreateResult
    {
        qint32 reservedFirst = 0;
        QString reservedSecond;
        qint32 reservedThird = 2;
        QString reservedFourth;
    };

    Helper();
    Helper(const Helper& other);
    Helper(Helper&& other);
    Helper& operator=(const Helper& other);
    ~Helper() override;

    /// Has a colour look-up table made from a file. Where nobody answers, the last answer stands, and at
    /// first that of a new CreateResult.
    CreateResult createLut(const QString& file);
    /// What names a blob is for its keeper to say. There is no answer.
    void loadBlob(const QString& blob);
    /// The paths of all blobs by their identifiers, asked for anew at each call; where nobody answers, those
    /// of the last answer. The reference is valid as long as the helper, and a later call changes what it
    /// shows.
    const QMap<QString, QString>& registeredBlobId2Path() const;

private:
    void notify(const Details::CreateLutNotification& answer) override;
    void notify(const Details::GetUserBlobsNotification& answer) override;

    CreateResult m_createResult;
    /// A constant helper may ask as well.
    mutable QMap<QString, QString> m_registeredBlobId2Path;
};

namespace Details {

/// Asks for a colour look-up table to be made. Answered, before the publication ends, by a
/// CreateLutNotification with the same sender.
class EDITORMODEL_EXPORT CreateLutRequest : public ::Message::Types::Request<Details::Object>
{
public:
    CreateLutRequest(const Details::Object* about, const QString& toRead) : Request(about), file(toRead) {}

    /// Lives only until the publication ends.
    const QString& file;
};

/// Asks for a blob to be loaded; there is no answer.
class EDITORMODEL_EXPORT LoadBlobRequest : public ::Message::Types::Request<Details::Object>
{
public:
    LoadBlobRequest(const Details::Object* about, const QString& toLoad) : Request(about), blob(toLoad) {}

    /// Lives only until the publication ends.
    const QString& blob;
};

/// Asks which blobs there are. Answered, before the publication ends, by a GetUserBlobsNotification with the
/// same sender.
class EDITORMODEL_EXPORT GetUserBlobsRequest : public ::Message::Types::Request<Details::Object>
{
public:
    explicit GetUserBlobsRequest(const Details::Object* about) : Request(about) {}
};

class EDITORMODEL_EXPORT CreateLutNotification : public ::Message::Types::Notification<Details::Object>
{
public:
    CreateLutNotification(const Details::Object* about, const Helper::CreateResult* answer)
        : Notification(about), result(answer)
    {}

    /// Not null; it lives until the publication ends.
    const Helper::CreateResult* result;
};

class EDITORMODEL_EXPORT GetUserBlobsNotification : public ::Message::Types::Notification<Details::Object>
{
public:
    GetUserBlobsNotification(const Details::Object* about, QMap<QString, QString> answer)
        : Notification(about), registeredBlobId2Path(std::move(answer))
    {}

    QMap<QString, QString> registeredBlobId2Path;
};

} // namespace Details

} // namespace UserBlob
