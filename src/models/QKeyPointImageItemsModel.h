#pragma once

#include "models/FlatListModel.h"
#include "models/KeyPointImageItems.h"

// The waypoint symbol list for the interface. The list itself belongs to the
// key point data; this model only shows it.
class QKeyPointImageItemsModel : public FlatListModel
{
    Q_OBJECT

public:
    enum Role { TitleRole = Qt::UserRole + 1, ImageSourceRole, KeyPointImageItemIdRole, IsAnimatedRole, StyleRole };

    explicit QKeyPointImageItemsModel(QObject *parent = nullptr);

    using QAbstractItemModel::setData;
    void setData(KeyPointImageItems *items);
    // Fills the list anew, once the catalogue is loaded.
    void refill(const std::vector<WaypointItem> &waypoints, const QString &browseTitle);

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

private:
    KeyPointImageItems *m_items = nullptr;
};
