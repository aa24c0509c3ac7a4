// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>
#include <EditorModel/bus/PubSub.h>
#include <EditorModel/persistence/Persistent.h>

#include <QString>

#include <deque>
#include <set>

namespace Quiz {

/// A question with its answers. Nobody here judges an answer.
class EDITORMODEL_EXPORT Question : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Question)

public:
    /// The types belong to the modules that show quizzes; other values are reached by a cast.
    enum Type : int
    {
        DefaultType = 0,
    };

    Type type = DefaultType;
    QString text;
    /// In the order in which they are shown.
    std::deque<QString> answers;
    /// By their text; nothing requires that `answers` has them.
    std::set<QString> correctAnswers;
};

/// Questions that a clip puts on a timeline.
class EDITORMODEL_EXPORT Preset : public Serialize::ISerializable, public virtual PubSub::Object
{
    EDITORMODEL_PERSISTENT(Preset)

public:
    /// "x-application/QuizPreset-serialized", for the clipboard and for drag and drop.
    static const QString* const mimeType;

    std::deque<Question> questions;
    /// The name in the library.
    QString tag;
    QString description;
};

/// Field by field, answers in order.
EDITORMODEL_EXPORT bool operator==(const Question& a, const Question& b);

/// Field by field, questions in order.
EDITORMODEL_EXPORT bool operator==(const Preset& a, const Preset& b);

} // namespace Quiz

EDITORMODEL_ARCHIVE_NAME(Quiz::Question, "Quiz::Question")
EDITORMODEL_ARCHIVE_NAME(Quiz::Preset, "Quiz::Preset")
