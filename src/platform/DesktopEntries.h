#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

// One application entry (.desktop file) of the desktop's menus: the keys of its
// "[Desktop Entry]" group that a program launcher needs. Localized keys are ignored.
struct DesktopEntry
{
    QString id;       // desktop-file id: path below "applications/" with "-" for "/"
    QString filePath;
    QString type;
    QString name;
    QString exec;     // the command line, string escapes already resolved
    QString tryExec;
    QStringList categories;
    QStringList mimeTypes;
    bool hidden = false;    // the entry counts as deleted
    bool noDisplay = false; // not for menus

    // Reads the main group from the text of a .desktop file. Nothing when the text has
    // no "[Desktop Entry]" group.
    static std::optional<DesktopEntry> parse(const QByteArray &text);
    static std::optional<DesktopEntry> read(const QString &filePath, const QString &id);
};

namespace desktopentries {

// "applications" below $XDG_DATA_HOME and each of $XDG_DATA_DIRS, first to last.
QStringList applicationFolders();

// The entries of all application folders, one per desktop-file id: an earlier folder's
// file hides any later one of the same id, also when it is unreadable or Hidden. Hidden
// entries are left out. Ordered by folder, then by id.
std::vector<DesktopEntry> applicationEntries();

// Splits an Exec value into the program and its arguments by the entry format's
// quoting rules. Nothing for an unterminated quote or an empty command.
std::optional<QStringList> splitCommandLine(const QString &exec);

// Arguments of a split command line as they go to the program that opens file: the first
// file or URL code (%f %F %u %U) becomes file (appended when there is none), %c the
// name, %k the entry's file, %% a percent sign; other codes go. An argument that was
// only codes and comes out empty is dropped.
QStringList expandFieldCodes(const QStringList &arguments, const QString &file, const QString &name,
                             const QString &entryFile);

// The program of a command line as a file: an absolute path as it stands, a plain
// name through PATH. Empty when it is no executable file.
QString resolveProgram(const QString &program);

} // namespace desktopentries
