// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <EditorModel/Export.h>

#include <QString>

/// Turns a key into the text to show to the user. Texts that were registered, for instance by a content
/// package, go before Qt's translation files. Keys and locales are compared exactly: no locale stands in for
/// another one, and the case counts. All of it belongs to one thread.
class EDITORMODEL_EXPORT Translator
{
public:
    Translator() = delete;

    /// Empty until it is set. The reference is valid for the life of the process and shows later changes.
    static const QString& currentLocale();
    /// Nobody is told: whoever shows texts asks for them again.
    static void setCurrentLocale(const QString& locale);

    /// A text for every locale; there is no way to take it back, but it may be replaced.
    static void registerTranslation(const QString& key, const QString& text);
    /// A text for one locale. It is shown only while the key has no text for every locale.
    static void registerTranslation(const QString& key, const QString& text, const QString& locale);
    /// Takes back the key's texts for single locales, all of them. The one for every locale stays. A key
    /// without such texts is ignored.
    static void unregisterTranslation(const QString& key);

    /// The key's text for every locale, else the one for the current locale, else Qt's translation in the
    /// context "editorModel", else the key itself.
    static QString translate(const QString& key);
    /// The key is UTF-8; null gives a null text, unless one is registered for the empty key.
    static QString translate(const char* key);
};
