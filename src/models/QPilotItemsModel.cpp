#include "models/QPilotItemsModel.h"

#include <QTimer>

#include <algorithm>

QPilotItemsModel::QPilotItemsModel(QObject *parent) : FlatListModel(parent) {}

void QPilotItemsModel::setData(PilotItemsData *data)
{
    beginResetModel();
    m_data = data;
    endResetModel();
}

void QPilotItemsModel::fill(const ContentCatalogue &catalogue, const QString &browseTitle)
{
    if (!m_data)
        return;
    beginResetModel();
    m_data->fillPilotItems(catalogue, browseTitle);
    endResetModel();
    emit pilotGroupsChanged();
    emit currentPilotChanged();
}

void QPilotItemsModel::connectSignalList(QObject *root)
{
    connectSignalsByName(root, QStringLiteral("PilotItemsSignalList_Obj"),
                         {"changePilotItem", "changeCurrentPilotItemWidth", "changeCurrentPilotItemRotation",
                          "setDeletePilotID", "updateGroupByIndex", "updateGroupById", "refresh"});
}

QStringList QPilotItemsModel::pilotGroups() const
{
    return m_data ? m_data->pilotGroups() : QStringList();
}

QVariantMap QPilotItemsModel::currentPilot() const
{
    return m_data ? m_data->currentPilot() : QVariantMap();
}

QVariantMap QPilotItemsModel::activeGroup() const
{
    return m_data ? m_data->activeGroup() : QVariantMap();
}

int QPilotItemsModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() || !m_data ? 0 : m_data->rowCount();
}

QVariant QPilotItemsModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.row() >= rowCount())
        return QVariant();
    const PilotItem &item = m_data->items()[size_t(index.row())];
    switch (role) {
    case Qt::DisplayRole:
    case TitleRole:
        return item.title;
    case ImageSourceRole:
        return item.thumbFileName;
    case PilotIdRole:
        return item.pilotId;
    case IsAnimatedRole:
        return item.isAnimated;
    case PilotStyleRole:
        return item.pilotStyle;
    case PilotWidthRole:
        return item.pilotWidth;
    case PilotRotationRole:
        return item.pilotRotation;
    case PilotGroupIdRole:
        return item.pilotGroupId;
    case PilotGroupNameRole:
        return item.pilotGroupName;
    case IsUserContentRole:
        return item.isUserContent;
    case ContentPackageIdRole:
        return item.contentPackageID;
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> QPilotItemsModel::roleNames() const
{
    return {{TitleRole, "title"},
            {ImageSourceRole, "imageSource"},
            {PilotIdRole, "pilotId"},
            {IsAnimatedRole, "isAnimated"},
            {PilotStyleRole, "pilotStyle"},
            {PilotWidthRole, "pilotWidth"},
            {PilotRotationRole, "pilotRotation"},
            {PilotGroupIdRole, "pilotGroupId"},
            {PilotGroupNameRole, "pilotGroupName"},
            {IsUserContentRole, "isUserContent"},
            {ContentPackageIdRole, "contentPackageID"}};
}

void QPilotItemsModel::activeKeyPointIdChanged()
{
    emit currentPilotChanged();
}

void QPilotItemsModel::changePilotItem(int pilotId)
{
    if (!m_data)
        return;
    if (m_data->isBrowseItem(uint32_t(pilotId))) {
        browse();
        return;
    }
    if (!m_data->changePilotItem(uint32_t(pilotId)))
        return;
    emit currentPilotChanged();
    emit projectIsModified();
}

void QPilotItemsModel::browse()
{
    const std::optional<PilotItem> item = m_data->browseUserPilot();
    if (!item) {
        const QString error = m_data->browseError();
        if (!error.isEmpty())
            emit showError(error);
        // The interface shows the avatar it had again.
        emit currentPilotChanged();
        return;
    }
    const int row = std::min(int(PilotItemsData::userItemRow), rowCount());
    beginInsertRows(QModelIndex(), row, row);
    m_data->insertUserItem(*item);
    endInsertRows();
    emit currentPilotChanged();
    emit projectIsModified();
}

void QPilotItemsModel::changeCurrentPilotItemWidth(double width)
{
    if (!m_data || !m_data->setCurrentPilotWidth(width))
        return;
    emit currentPilotChanged();
    emit projectIsModified();
}

void QPilotItemsModel::changeCurrentPilotItemRotation(bool state)
{
    if (!m_data || !m_data->setCurrentPilotRotation(state))
        return;
    emit currentPilotChanged();
    emit projectIsModified();
}

void QPilotItemsModel::setDeletePilotID(int pilotId)
{
    if (m_data)
        m_data->setDeletePilotId(uint32_t(pilotId));
}

void QPilotItemsModel::deleteUserPilot()
{
    if (!m_data)
        return;
    const int row = m_data->takeDeletion();
    if (m_data->deletionIsCurrent()) {
        const int fallback = m_data->rowOfTitle(PilotItemsData::noAvatarTitle);
        if (fallback >= 0)
            changePilotItem(int(m_data->items()[size_t(fallback)].pilotId));
    }
    if (row >= 0) {
        beginRemoveRows(QModelIndex(), row, row);
        m_data->removeRow(row);
        endRemoveRows();
    }
    QTimer::singleShot(deleteDelayMs, this, &QPilotItemsModel::DoDeleteUserPilot);
}

void QPilotItemsModel::DoDeleteUserPilot()
{
    if (m_data)
        m_data->removeDeletedAvatarFiles();
}

void QPilotItemsModel::updateGroupByIndex(int pilotIndex)
{
    if (m_data && m_data->updateGroupByIndex(pilotIndex))
        emit activeGroupChanged();
}

void QPilotItemsModel::updateGroupById(int id)
{
    if (m_data && m_data->updateGroupById(id))
        emit activeGroupChanged();
}

void QPilotItemsModel::refresh()
{
    if (!m_data)
        return;
    beginResetModel();
    m_data->refresh();
    endResetModel();
    emit pilotGroupsChanged();
    emit currentPilotChanged();
}
