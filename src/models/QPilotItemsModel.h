#pragma once

#include "models/FlatListModel.h"
#include "models/PilotItemsData.h"

#include <QStringList>
#include <QVariantMap>

// The avatar list of the interface, its groups and the avatar of the active segment.
// The list and every change of it are PilotItemsData's; this model forwards the
// interface's requests and tells it what changed.
class QPilotItemsModel : public FlatListModel
{
    Q_OBJECT
    Q_PROPERTY(QStringList pilotGroups READ pilotGroups NOTIFY pilotGroupsChanged)
    Q_PROPERTY(QVariantMap currentPilot READ currentPilot NOTIFY currentPilotChanged)
    Q_PROPERTY(int pilotMirroringAnimationDuration READ pilotMirroringAnimationDuration NOTIFY
                   pilotMirroringAnimationDurationChanged)
    Q_PROPERTY(QVariantMap activeGroup READ activeGroup NOTIFY activeGroupChanged)

public:
    enum Role {
        TitleRole = Qt::UserRole + 1,
        ImageSourceRole,
        PilotIdRole,
        IsAnimatedRole,
        PilotStyleRole,
        PilotWidthRole = Qt::UserRole + 7, // 262 is not used
        PilotRotationRole,
        PilotGroupIdRole,
        PilotGroupNameRole,
        IsUserContentRole,
        ContentPackageIdRole,
    };

    // How long the interface takes to turn the avatar round; the document has no
    // setting for it.
    static constexpr int mirroringAnimationDuration = 300;
    // The interface's image loaders let go of a deleted avatar's files within this time.
    static constexpr int deleteDelayMs = 500;

    explicit QPilotItemsModel(QObject *parent = nullptr);

    using QAbstractItemModel::setData;
    void setData(PilotItemsData *data);
    // Fills the list anew from the catalogue.
    void fill(const ContentCatalogue &catalogue, const QString &browseTitle);
    // Connects the signals of the interface's "PilotItemsSignalList_Obj" under `root` to the
    // slots of the same names; without that object nothing is connected.
    void connectSignalList(QObject *root);

    QStringList pilotGroups() const;
    QVariantMap currentPilot() const;
    int pilotMirroringAnimationDuration() const { return mirroringAnimationDuration; }
    QVariantMap activeGroup() const;

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

signals:
    void pilotGroupsChanged();
    void currentPilotChanged();
    void pilotMirroringAnimationDurationChanged();
    // `text` is the key of the interface's text, which the map view looks up.
    void showError(QString text);
    void activeGroupChanged();
    void projectIsModified();

public slots:
    // The active key point changed: the current pilot is that of another segment.
    void activeKeyPointIdChanged();
    // Removes the row chosen with setDeletePilotID at once and its files after
    // deleteDelayMs. The current avatar falls back to "01_no_avatar".
    void deleteUserPilot();

private slots:
    void changePilotItem(int pilotId);
    void changeCurrentPilotItemWidth(double width);
    void changeCurrentPilotItemRotation(bool state);
    void setDeletePilotID(int pilotId);
    void DoDeleteUserPilot();
    void updateGroupByIndex(int pilotIndex);
    void updateGroupById(int id);
    void refresh();

private:
    void browse();

    PilotItemsData *m_data = nullptr;
};
