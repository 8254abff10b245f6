#include "models/QKeyPointImageItemsModel.h"

QKeyPointImageItemsModel::QKeyPointImageItemsModel(QObject *parent) : FlatListModel(parent) {}

void QKeyPointImageItemsModel::setData(KeyPointImageItems *items)
{
    beginResetModel();
    m_items = items;
    endResetModel();
}

void QKeyPointImageItemsModel::refill(const std::vector<WaypointItem> &waypoints, const QString &browseTitle)
{
    if (!m_items)
        return;
    beginResetModel();
    m_items->fill(waypoints, browseTitle);
    endResetModel();
}

int QKeyPointImageItemsModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() || !m_items ? 0 : m_items->size();
}

QVariant QKeyPointImageItemsModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.row() >= rowCount())
        return QVariant();
    const KeyPointImageItem &item = m_items->items()[size_t(index.row())];
    switch (role) {
    case Qt::DisplayRole:
    case TitleRole:
        return item.title;
    case ImageSourceRole:
        return item.thumbFileName;
    case KeyPointImageItemIdRole:
        return item.keyPointImageItemId;
    case IsAnimatedRole:
        return item.isAnimated;
    case StyleRole:
        // Symbols have no display format of their own; the avatars' default stands in.
        return QStringLiteral("2D");
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> QKeyPointImageItemsModel::roleNames() const
{
    return {{TitleRole, "title"},
            {ImageSourceRole, "imageSource"},
            {KeyPointImageItemIdRole, "keyPointImageItemId"},
            {IsAnimatedRole, "isAnimated"},
            {StyleRole, "style"}};
}
