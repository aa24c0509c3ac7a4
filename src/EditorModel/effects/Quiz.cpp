// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/effects/Quiz.h>

#include <EditorModel/persistence/Fields.h>

namespace Quiz {

bool operator==(const Question& a, const Question& b)
{
    return &a == &b || (a.type == b.type && a.text == b.text && a.answers == b.answers &&
                        a.correctAnswers == b.correctAnswers);
}

bool operator==(const Preset& a, const Preset& b)
{
    return &a == &b || (a.questions == b.questions && a.tag == b.tag && a.description == b.description);
}

void fields(Serialize::Fields& f, Question& question)
{
    f("type", question.type)("text", question.text)("answers", question.answers);
    f("correctAnswers", question.correctAnswers);
}

void fields(Serialize::Fields& f, Preset& preset)
{
    f("questions", preset.questions)("tag", preset.tag)("description", preset.description);
}

} // namespace Quiz

EDITORMODEL_PERSISTENT_CLASS(Quiz::Question)
EDITORMODEL_PERSISTENT_CLASS(Quiz::Preset)
