#pragma once

#include "app/AppSettings.h"
#include "mapview/FileDialogs.h"
#include "models/KeyPointItemsData.h"
#include "models/PilotItemsData.h"

#include <QDateTime>
#include <QObject>
#include <QVariantMap>

#include <memory>
#include <vector>

class KeyPoint;
class PainterPathRenderer_Controller;

// What the map view asks of the document for the project commands: the translated
// strings and message-box actions of the interface, the file dialogs with their
// filters and proposed names, new, load and save.
class QMainController : public QObject
{
    Q_OBJECT

public:
    // Kinds of file filter.
    enum FilterKind { ProjectFiles = 0, TrackFiles = 1, ContentWithArchives = 2, Content = 3, Images = 4, Photos = 5 };

    QMainController(PainterPathRenderer_Controller *document, const AppSettings &settings);

    AppSettings &settings() { return m_settings; }
    const AppSettings &settings() const { return m_settings; }

    // The interface's text for `key`; the key itself, logged, when there is none.
    QString getString(const QString &key) const;
    QVariantMap strings() const { return m_strings; }
    void setStrings(const QVariantMap &strings);

    // Message-box action names to ids, as the interface reads them.
    QVariantMap actions() const { return m_actions; }
    // The id of `name`; 0 for a name that is not in the table.
    int action(const QString &name) const { return m_actions.value(name).toInt(); }

    // "line" 0, "curve" 1, "airplane" 2, "route" 3
    QVariantMap pathModes() const;
    // The user's path mode into the document and the current path's generator; false
    // and nothing changed for an unknown mode.
    bool applyPathMode(int mode);

    QString fileFilter(FilterKind kind) const;
    // Full path without extension that the save dialogs propose.
    static QString proposedSaveName(const QString &folder, const std::vector<KeyPoint> &keyPoints,
                                    const QDateTime &now);

    // The load dialog; false when cancelled. The folder of an existing file becomes
    // the "projectPath".
    bool loadDialog(QString &fileName, bool track);
    // The save dialog with the proposed names; false when cancelled. Remembers the
    // folder under "projectPath".
    bool saveNameDialog(QString &fileName, const QString &filter);
    // The save dialog and the writing of the project; false when cancelled or when
    // the file could not be written whole.
    bool saveProject(QString &fileName);

    void newProject();
    // A new project, then the file as a project or else as a track. False when it is
    // neither; `isProject` tells which it was.
    bool loadFile(const QString &fileName, bool &isProject);

    bool isFirstStart() const { return m_isFirstStart; }
    bool markerLocked() const { return m_markerLocked; }
    // The lock of the hovered key point `keyPointId` (0 for none): the first and last
    // key point of a track stay where they are. True when the lock changed.
    bool updateMarkerLock(uint32_t keyPointId);
    QString programVersion() const { return m_programVersion; }

    // The waypoints of the active path as the interface lists and edits them.
    KeyPointItemsData &keyPointData() { return m_keyPointData; }
    // The avatars, chosen for the segment of the active key point.
    PilotItemsData &pilotData() { return m_pilotData; }

    FileDialogs &fileDialogs() { return *m_fileDialogs; }
    void setFileDialogs(std::unique_ptr<FileDialogs> dialogs) { m_fileDialogs = std::move(dialogs); }

private:
    PainterPathRenderer_Controller *m_document;
    AppSettings m_settings;
    QVariantMap m_strings;
    QVariantMap m_actions;
    std::unique_ptr<FileDialogs> m_fileDialogs;
    KeyPointItemsData m_keyPointData;
    PilotItemsData m_pilotData;
    QString m_programVersion;
    bool m_isFirstStart = false;
    bool m_markerLocked = false;
};
