#include "app/Translators.h"

#include "app/AppSettings.h"
#include "app/Trace.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QTranslator>

namespace {
Translators *registered = nullptr;
}

Translators::Translators(AppSettings &settings, const QString &programDir)
    : m_settings(settings), m_programDir(programDir)
{
    for (int i = 0; i < LanguageTable::Count; ++i) {
        m_table[i] = std::make_unique<QTranslator>();
        const QString file = LanguageTable::filePath(i, programDir);
        // load() would fall back to "Tourlet.qm" for a missing file, showing the
        // installer's language under another language's name.
        if (!QFileInfo(file).isFile() || !m_table[i]->load(file))
            logTrace(1, QStringLiteral("Translators: can't load %s"), file);
    }
    if (!registered)
        registered = this;
}

Translators::~Translators()
{
    if (m_current >= 0)
        QCoreApplication::removeTranslator(m_table[m_current].get());
    if (registered == this)
        registered = nullptr;
}

Translators *Translators::instance()
{
    return registered;
}

bool Translators::install(uint32_t index)
{
    const uint32_t resolved = LanguageTable::resolveRequest(index, m_programDir);
    if (m_current >= 0) {
        QCoreApplication::removeTranslator(m_table[m_current].get());
        m_current = -1;
    }
    if (resolved >= static_cast<uint32_t>(LanguageTable::Count)) {
        logTrace(1, QStringLiteral("Translators::install: %d is no language"), resolved);
        return false;
    }

    const int chosen = static_cast<int>(resolved);
    QCoreApplication::installTranslator(m_table[chosen].get());
    m_current = chosen;
    storeLanguage(m_settings, chosen);
    m_settings.setCurrentLanguage(chosen);
    m_settings.setLanguageName(LanguageTable::longName(chosen));
    logTrace(0, QStringLiteral("Translators::install: %s"), LanguageTable::shortSuffix(chosen));
    return true;
}
