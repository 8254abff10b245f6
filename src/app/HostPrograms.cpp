#include "app/HostPrograms.h"

#include "app/AppSettings.h"
#include "app/Trace.h"
#include "platform/DesktopEntries.h"

#include <QDir>
#include <QFileInfo>
#include <QProcess>
#include <QVariantMap>

#include <algorithm>
#include <optional>

namespace {

const QString FilmType = QStringLiteral("video/mp4");

// "AudioVideoEditing" is shared by audio and video editors; entries of audio editors
// also name "Audio" and no "Video".
bool isVideoEditor(const QStringList &categories)
{
    const auto has = [&](const char *category) { return categories.contains(QLatin1String(category)); };
    if (has("VideoEditing"))
        return true;
    if (!has("AudioVideoEditing"))
        return false;
    return has("Video") || (has("AudioVideo") && !has("Audio"));
}

std::optional<HostInfo> hostFromEntry(const DesktopEntry &entry)
{
    if (entry.type != QLatin1String("Application") || entry.noDisplay)
        return std::nullopt;
    if (!isVideoEditor(entry.categories) || !entry.mimeTypes.contains(FilmType, Qt::CaseInsensitive))
        return std::nullopt;
    if (entry.name.isEmpty()) {
        logTrace(1, QStringLiteral("HostPrograms: %s has no name"), entry.filePath);
        return std::nullopt;
    }
    if (!entry.tryExec.isEmpty() && desktopentries::resolveProgram(entry.tryExec).isEmpty())
        return std::nullopt; // not installed, by the entry's own test
    const auto commandLine = desktopentries::splitCommandLine(entry.exec);
    if (!commandLine) {
        logTrace(3, QStringLiteral("HostPrograms: %s has an unreadable command line"), entry.filePath);
        return std::nullopt;
    }
    const QString program = desktopentries::resolveProgram(commandLine->first());
    if (program.isEmpty()) {
        logTrace(1, QStringLiteral("HostPrograms: program %s of %s not found"), commandLine->first(),
                 entry.filePath);
        return std::nullopt;
    }
    const QFileInfo programInfo(program);
    HostInfo host;
    host.registryPath = entry.filePath;
    host.programExe = programInfo.fileName();
    host.programPath = programInfo.absolutePath();
    host.programTitle = entry.name;
    host.execArguments = commandLine->mid(1);
    return host;
}

} // namespace

QString HostInfo::programFile() const
{
    return QDir(programPath).filePath(programExe);
}

int HostPrograms::updateHostList()
{
    m_hostList.clear();
    for (const DesktopEntry &entry : desktopentries::applicationEntries()) {
        if (auto host = hostFromEntry(entry))
            m_hostList.append(std::move(*host));
    }
    std::stable_sort(m_hostList.begin(), m_hostList.end(), [](const HostInfo &a, const HostInfo &b) {
        return a.programTitle.compare(b.programTitle, Qt::CaseInsensitive) < 0;
    });
    logTrace(0, QStringLiteral("HostPrograms::updateHostList: %d video editors"), int(m_hostList.size()));
    return m_hostList.size();
}

bool HostPrograms::findHost(const QStringList &hostArguments, const AppSettings &settings)
{
    if (hostArguments.size() == 2) {
        logTrace(1, QStringLiteral("HostPrograms::findHost: no host window to look for, %s ignored"),
                 hostArguments.join(QLatin1Char(' ')));
        return false;
    }
    if (updateHostList() == 0) {
        m_currentHost = HostInfo();
        return false;
    }
    const QString chosen = settings.host();
    const auto match = std::find_if(m_hostList.cbegin(), m_hostList.cend(),
                                    [&](const HostInfo &host) { return host.programTitle == chosen; });
    m_currentHost = match != m_hostList.cend() ? *match : m_hostList.first();
    logTrace(0, QStringLiteral("HostPrograms::findHost: %s"), m_currentHost.programTitle);
    return true;
}

bool HostPrograms::selectHost(int index, AppSettings &settings)
{
    if (index < 0 || index >= m_hostList.size())
        return false;
    m_currentHost = m_hostList.at(index);
    if (!m_currentHost.isUsable())
        return false;
    settings.setHost(m_currentHost.programTitle);
    return true;
}

bool HostPrograms::sendVideoToHost(const QString &path) const
{
    if (!m_currentHost.isUsable() || path.isEmpty()) {
        logTrace(1, QStringLiteral("HostPrograms::sendVideoToHost: no host for %s"), path);
        return false;
    }
    const QStringList arguments = desktopentries::expandFieldCodes(
        m_currentHost.execArguments, path, m_currentHost.programTitle, m_currentHost.registryPath);
    qint64 pid = 0;
    const bool started = QProcess::startDetached(m_currentHost.programFile(), arguments,
                                                 m_currentHost.programPath, &pid);
    if (started) {
        logTrace(0, QStringLiteral("HostPrograms::sendVideoToHost: %s started as %d with %s"),
                 m_currentHost.programFile(), pid, path);
    } else {
        logTrace(3, QStringLiteral("HostPrograms::sendVideoToHost: can't start %s"), m_currentHost.programFile());
    }
    return started;
}

QVariantList HostPrograms::hostComboEntries(const AppSettings &settings) const
{
    const QString chosen = settings.host();
    QVariantList entries;
    bool selected = false;
    for (const HostInfo &host : m_hostList) {
        const bool isChosen = !selected && host.programTitle.compare(chosen, Qt::CaseInsensitive) == 0;
        selected = selected || isChosen;
        entries.append(QVariantMap{{QStringLiteral("title"), host.programTitle},
                                   {QStringLiteral("selected"), isChosen ? 1 : 0}});
    }
    return entries;
}

HostPrograms &hostPrograms()
{
    static HostPrograms state;
    return state;
}

QStringList parseHostArguments(const QStringList &arguments)
{
    if (arguments.size() != 3)
        return {};
    const QString &window = arguments.at(1);
    const QString &key = arguments.at(2);
    constexpr int SwitchLength = 4;
    if (window.size() <= SwitchLength || key.size() <= SwitchLength)
        return {};
    if (!window.startsWith(QLatin1String("/h=?")) || !key.startsWith(QLatin1String("/k=?")))
        return {};
    return {window.mid(SwitchLength), key.mid(SwitchLength)};
}
