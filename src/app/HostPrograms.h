#pragma once

#include <QString>
#include <QStringList>
#include <QVariantList>
#include <QVector>

class AppSettings;

// One host program: a video editor installed on this machine, to which a finished film
// can be handed over.
struct HostInfo
{
    QString registryPath;  // the application entry (.desktop file) it was read from
    QString programExe;    // file name of the program
    QString programPath;   // its folder
    QString programTitle;  // the entry's unlocalized name; what the "host" setting holds
    QString msiDirContent; // content folder; editors on Linux have none
    // The arguments of the entry's command line, field codes still in them.
    QStringList execArguments;

    bool isUsable() const { return !programExe.isEmpty() && !programPath.isEmpty(); }
    QString programFile() const;
};

// The host programs known to this run and the one chosen. Hosts are the application
// entries of the XDG data folders that are video editors and open MP4 films. Linux has
// no window hand-over: a film always goes to a fresh start of the chosen editor.
class HostPrograms
{
public:
    // Lists the installed editors anew, sorted by title; returns how many there are.
    int updateHostList();

    // Host search at start. With the two strings of parseHostArguments the host would be
    // found by its window, which Linux has not: false. With none, the host list is built
    // and the "host" setting picks the current host (exact title, else the first entry);
    // false when there is no editor at all.
    bool findHost(const QStringList &hostArguments, const AppSettings &settings);

    // Makes entry index current; when it is usable its title goes to the "host" setting.
    // False for an index outside the list or an unusable entry.
    bool selectHost(int index, AppSettings &settings);

    // Starts the current host, detached, with the film as its argument. False when there
    // is no usable host or the start failed.
    bool sendVideoToHost(const QString &path) const;

    const QVector<HostInfo> &hostList() const { return m_hostList; }
    const HostInfo &currentHost() const { return m_currentHost; }

    // Title of the current host, empty without one.
    QString hostName() const { return m_currentHost.programTitle; }

    // The host combo box: a fresh list of {"title", "selected"} maps, one per listed host;
    // "selected" is 1 on the entry whose title equals the "host" setting regardless of
    // case, 0 elsewhere.
    QVariantList hostComboEntries(const AppSettings &settings) const;

private:
    QVector<HostInfo> m_hostList;
    HostInfo m_currentHost;
};

// The host state of this process.
HostPrograms &hostPrograms();

// The two switches a host program starts us with: exactly three arguments, the program
// then "/h=?<window>" and "/k=?<key>", each longer than its four characters. Returns
// the text behind the switches, or an empty list for any other command line.
QStringList parseHostArguments(const QStringList &arguments);
