#pragma once

#include "app/Language.h"

#include <QString>

#include <array>
#include <cstdint>
#include <memory>

class AppSettings;
class QTranslator;

// The translators of the seven interface languages, all loaded at start so that a
// switch of language reads no file. At most one of them is installed in the
// application at a time. The program makes one table at start; the interface's
// language switch reaches it through instance().
class Translators
{
public:
    // Loads "language/Tourlet_XX.qm" from programDir (the working folder when empty).
    // A file that can't be loaded leaves an empty translator, installed without effect.
    explicit Translators(AppSettings &settings, const QString &programDir = QString());
    ~Translators();

    Translators(const Translators &) = delete;
    Translators &operator=(const Translators &) = delete;

    // The table of this process, or null before it is made and after it is gone.
    static Translators *instance();

    // Installs the translator of index in place of the current one and stores the
    // index under "language". LanguageTable::FromFileSize picks the language whose
    // file has the size of "language/Tourlet.qm"; any other index from 7 on takes the
    // current one out and installs nothing. False when nothing was installed.
    bool install(uint32_t index);

    // The language switch of the interface: indices outside the table mean English.
    // The caller retranslates its QML engine afterwards.
    bool setLanguage(int index) { return install(static_cast<uint32_t>(LanguageTable::normalized(index))); }

    // The installed index, or -1 while none is.
    int current() const { return m_current; }

private:
    std::array<std::unique_ptr<QTranslator>, LanguageTable::Count> m_table;
    AppSettings &m_settings;
    QString m_programDir;
    int m_current = -1;
};
