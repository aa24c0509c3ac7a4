// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/services/Translator.h>

#include <QCoreApplication>

#include <map>

namespace {

struct Texts
{
    QString currentLocale;
    std::map<QString, QString> plain;
    /// By key, then by locale.
    std::map<QString, std::map<QString, QString>> localized;
};

/// Never destroyed: what runs at exit may still want a text.
Texts& texts()
{
    static Texts* const instance = new Texts;
    return *instance;
}

/// Null if there is none.
const QString* registeredText(const QString& key)
{
    const auto plain = texts().plain.find(key);
    if (plain != texts().plain.end())
        return &plain->second;
    const auto localized = texts().localized.find(key);
    if (localized == texts().localized.end())
        return nullptr;
    const auto text = localized->second.find(texts().currentLocale);
    return text != localized->second.end() ? &text->second : nullptr;
}

QString textFromQt(const char* key)
{
    return QCoreApplication::translate("editorModel", key, nullptr, -1);
}

} // namespace

const QString& Translator::currentLocale()
{
    return texts().currentLocale;
}

void Translator::setCurrentLocale(const QString& locale)
{
    texts().currentLocale = locale;
}

void Translator::registerTranslation(const QString& key, const QString& text)
{
    texts().plain[key] = text;
}

void Translator::registerTranslation(const QString& key, const QString& text, const QString& locale)
{
    texts().localized[key][locale] = text;
}

void Translator::unregisterTranslation(const QString& key)
{
    texts().localized.erase(key);
}

QString Translator::translate(const QString& key)
{
    const QString* const text = registeredText(key);
    return text ? *text : textFromQt(key.toUtf8().constData());
}

QString Translator::translate(const char* key)
{
    const QString* const text = registeredText(QString::fromUtf8(key));
    return text ? *text : textFromQt(key);
}
