// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Translator.h>

#include <gmock/gmock.h>

#include <QCoreApplication>
#include <QTranslator>

#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

static_assert(!std::is_default_constructible_v<Translator>);
static_assert(std::is_same_v<decltype(Translator::currentLocale()), const QString&>);

/// Read before any test can set it.
const QString localeAtStart = Translator::currentLocale();

/// What is registered for every locale stays for the whole process, so each test has keys of its own.
class TranslatorTest : public testing::Test
{
protected:
    TranslatorTest() { Translator::setCurrentLocale(QString()); }
    ~TranslatorTest() override { Translator::setCurrentLocale(QString()); }
};

/// A translation file that knows every text that starts with "qt", and notes what it is asked.
class File : public QTranslator
{
public:
    bool isEmpty() const override { return false; }
    QString translate(const char* context, const char* text, const char* disambiguation, int n) const override
    {
        questions.push_back(std::string(context) + "|" + text + "|" +
                            (disambiguation ? disambiguation : "null") + "|" + std::to_string(n));
        return std::string(text).rfind("qt", 0) == 0 ? "Qt's " + QString::fromUtf8(text) : QString();
    }

    mutable std::vector<std::string> questions;
};

class TranslatorWithFileTest : public TranslatorTest
{
protected:
    TranslatorWithFileTest() { QCoreApplication::installTranslator(&m_file); }
    ~TranslatorWithFileTest() override { QCoreApplication::removeTranslator(&m_file); }

    std::vector<std::string> takeQuestions() { return std::exchange(m_file.questions, {}); }

private:
    char m_name[6] = "tests";
    char* m_arguments[2] = {m_name, nullptr};
    int m_count = 1;
    QCoreApplication m_application{m_count, m_arguments};
    File m_file;
};

TEST_F(TranslatorTest, HasNoLocaleAtFirst)
{
    EXPECT_EQ(localeAtStart, QString());
}

TEST_F(TranslatorTest, HasTheLocaleThatWasSetLast)
{
    const QString& locale = Translator::currentLocale();
    Translator::setCurrentLocale("de");
    EXPECT_EQ(locale, "de");
    Translator::setCurrentLocale("fr");
    EXPECT_EQ(locale, "fr");
    Translator::setCurrentLocale(locale);
    EXPECT_EQ(Translator::currentLocale(), "fr");
}

TEST_F(TranslatorTest, GivesTheKeyWhereNobodyHasAText)
{
    EXPECT_EQ(Translator::translate(QString("unknown")), "unknown");
    EXPECT_EQ(Translator::translate("unknown"), "unknown");
    EXPECT_EQ(Translator::translate(QString::fromUtf8("Größe")), QString::fromUtf8("Größe"));
    EXPECT_EQ(Translator::translate("Größe"), QString::fromUtf8("Größe"));
    EXPECT_EQ(Translator::translate(QString()), "");
    EXPECT_EQ(Translator::translate(static_cast<const char*>(nullptr)), "");
}

TEST_F(TranslatorTest, APlainTextHoldsForEveryLocale)
{
    Translator::registerTranslation("plain.every", "Text");
    for (const char* locale : {"", "de", "fr"}) {
        Translator::setCurrentLocale(locale);
        EXPECT_EQ(Translator::translate(QString("plain.every")), "Text") << locale;
        EXPECT_EQ(Translator::translate("plain.every"), "Text") << locale;
    }
}

TEST_F(TranslatorTest, TheLaterPlainTextReplacesTheEarlier)
{
    Translator::registerTranslation("plain.twice", "Earlier");
    Translator::registerTranslation("plain.twice", "Later");
    EXPECT_EQ(Translator::translate("plain.twice"), "Later");
}

TEST_F(TranslatorTest, AnEmptyTextIsAText)
{
    Translator::registerTranslation("plain.empty", "");
    EXPECT_EQ(Translator::translate("plain.empty"), "");
    Translator::registerTranslation("localized.empty", "", "de");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("localized.empty"), "");
}

TEST_F(TranslatorTest, ALocalizedTextHoldsForItsLocaleAlone)
{
    Translator::registerTranslation("localized.one", "Spur", "de");
    EXPECT_EQ(Translator::translate("localized.one"), "localized.one");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("localized.one"), "Spur");
    EXPECT_EQ(Translator::translate(QString("localized.one")), "Spur");
    Translator::setCurrentLocale("fr");
    EXPECT_EQ(Translator::translate("localized.one"), "localized.one");
}

TEST_F(TranslatorTest, GivesTheTextOfTheNewLocaleWithNoFurtherCall)
{
    Translator::registerTranslation("localized.two", "Spur", "de");
    Translator::registerTranslation("localized.two", "Piste", "fr");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("localized.two"), "Spur");
    Translator::setCurrentLocale("fr");
    EXPECT_EQ(Translator::translate("localized.two"), "Piste");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("localized.two"), "Spur");
}

TEST_F(TranslatorTest, TheEmptyLocaleIsALocaleToo)
{
    Translator::registerTranslation("localized.nowhere", "Nowhere", "");
    EXPECT_EQ(Translator::translate("localized.nowhere"), "Nowhere");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("localized.nowhere"), "localized.nowhere");
}

TEST_F(TranslatorTest, TheLaterTextOfALocaleReplacesThatOfThisLocaleAlone)
{
    Translator::registerTranslation("localized.twice", "Spur", "de");
    Translator::registerTranslation("localized.twice", "Piste", "fr");
    Translator::registerTranslation("localized.twice", "Bahn", "de");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("localized.twice"), "Bahn");
    Translator::setCurrentLocale("fr");
    EXPECT_EQ(Translator::translate("localized.twice"), "Piste");
}

TEST_F(TranslatorTest, APlainTextWinsOverALocalizedOneWhicheverCameFirst)
{
    Translator::setCurrentLocale("de");
    Translator::registerTranslation("both.plainFirst", "Plain");
    Translator::registerTranslation("both.plainFirst", "Spur", "de");
    EXPECT_EQ(Translator::translate("both.plainFirst"), "Plain");
    Translator::registerTranslation("both.plainLast", "Spur", "de");
    EXPECT_EQ(Translator::translate("both.plainLast"), "Spur");
    Translator::registerTranslation("both.plainLast", "Plain");
    EXPECT_EQ(Translator::translate("both.plainLast"), "Plain");
}

TEST_F(TranslatorTest, NeverTakesALanguageForARegionNorARegionForItsLanguage)
{
    Translator::registerTranslation("exact.language", "Januar", "de");
    Translator::registerTranslation("exact.region", "Jänner", "de_AT");
    Translator::setCurrentLocale("de_AT");
    EXPECT_EQ(Translator::translate("exact.language"), "exact.language");
    EXPECT_EQ(Translator::translate("exact.region"), QString::fromUtf8("Jänner"));
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("exact.language"), "Januar");
    EXPECT_EQ(Translator::translate("exact.region"), "exact.region");
}

TEST_F(TranslatorTest, TellsUpperFromLowerCaseInKeysAndLocales)
{
    Translator::registerTranslation("case.plain", "Text");
    EXPECT_EQ(Translator::translate("Case.plain"), "Case.plain");
    Translator::registerTranslation("case.localized", "Spur", "de");
    Translator::setCurrentLocale("DE");
    EXPECT_EQ(Translator::translate("case.localized"), "case.localized");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("Case.localized"), "Case.localized");
    EXPECT_EQ(Translator::translate("case.localized"), "Spur");
}

TEST_F(TranslatorTest, FindsKeysBeyondAsciiInBothForms)
{
    Translator::registerTranslation(QString::fromUtf8("beyond.Größe"), "Size");
    EXPECT_EQ(Translator::translate(QString::fromUtf8("beyond.Größe")), "Size");
    EXPECT_EQ(Translator::translate("beyond.Größe"), "Size");
}

TEST_F(TranslatorTest, UnregisteringTakesTheTextsOfAllLocalesOfThisKey)
{
    Translator::registerTranslation("gone.key", "Spur", "de");
    Translator::registerTranslation("gone.key", "Piste", "fr");
    Translator::registerTranslation("gone.other", "Bild", "de");
    Translator::unregisterTranslation("gone.key");
    Translator::setCurrentLocale("fr");
    EXPECT_EQ(Translator::translate("gone.key"), "gone.key");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("gone.key"), "gone.key");
    EXPECT_EQ(Translator::translate("gone.other"), "Bild");
}

TEST_F(TranslatorTest, RegisteringAgainBringsNoEarlierTextBack)
{
    Translator::registerTranslation("again.key", "Spur", "de");
    Translator::unregisterTranslation("again.key");
    Translator::registerTranslation("again.key", "Piste", "fr");
    Translator::setCurrentLocale("fr");
    EXPECT_EQ(Translator::translate("again.key"), "Piste");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("again.key"), "again.key");
}

TEST_F(TranslatorTest, UnregisteringLeavesThePlainTextAlone)
{
    Translator::registerTranslation("stays.only", "Plain");
    Translator::unregisterTranslation("stays.only");
    EXPECT_EQ(Translator::translate("stays.only"), "Plain");

    Translator::setCurrentLocale("de");
    Translator::registerTranslation("stays.both", "Plain");
    Translator::registerTranslation("stays.both", "Spur", "de");
    Translator::unregisterTranslation("stays.both");
    EXPECT_EQ(Translator::translate("stays.both"), "Plain");
}

TEST_F(TranslatorTest, UnregisteringAnUnknownKeyIsIgnored)
{
    Translator::registerTranslation("ignored.other", "Spur", "de");
    Translator::unregisterTranslation("ignored.key");
    EXPECT_EQ(Translator::translate("ignored.key"), "ignored.key");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("ignored.other"), "Spur");
}

TEST_F(TranslatorWithFileTest, AsksQtForAKeyThatIsNotRegistered)
{
    EXPECT_EQ(Translator::translate(QString::fromUtf8("qt.Größe")), QString::fromUtf8("Qt's qt.Größe"));
    EXPECT_THAT(takeQuestions(), ElementsAre("editorModel|qt.Größe|null|-1"));
    EXPECT_EQ(Translator::translate("qt.Größe"), QString::fromUtf8("Qt's qt.Größe"));
    EXPECT_THAT(takeQuestions(), ElementsAre("editorModel|qt.Größe|null|-1"));
    EXPECT_EQ(Translator::translate("other"), "other");
    EXPECT_THAT(takeQuestions(), ElementsAre("editorModel|other|null|-1"));
}

TEST_F(TranslatorWithFileTest, FallsThroughToQtWhereTheCurrentLocaleHasNoText)
{
    Translator::registerTranslation("qt.two", "Spur", "de");
    Translator::registerTranslation("qt.two", "Piste", "fr");
    Translator::setCurrentLocale("it");
    EXPECT_EQ(Translator::translate("qt.two"), "Qt's qt.two");
    EXPECT_EQ(Translator::translate(QString("qt.two")), "Qt's qt.two");
    Translator::setCurrentLocale("fr");
    EXPECT_EQ(Translator::translate("qt.two"), "Piste");
    Translator::unregisterTranslation("qt.two");
    EXPECT_EQ(Translator::translate("qt.two"), "Qt's qt.two");
}

TEST_F(TranslatorWithFileTest, NeverAsksQtForARegisteredKey)
{
    Translator::registerTranslation("qt.plain", "Plain");
    Translator::registerTranslation("qt.localized", "Spur", "de");
    Translator::setCurrentLocale("de");
    EXPECT_EQ(Translator::translate("qt.plain"), "Plain");
    EXPECT_EQ(Translator::translate("qt.localized"), "Spur");
    EXPECT_THAT(takeQuestions(), IsEmpty());
}

} // namespace
