#pragma once

#include <QAbstractItemModel>

// The frame of the interface's lists: one column of rows, no tree. Subclasses give
// rowCount, data and roleNames.
class FlatListModel : public QAbstractItemModel
{
public:
    using QAbstractItemModel::QAbstractItemModel;

    QModelIndex index(int row, int column, const QModelIndex &parent = QModelIndex()) const override
    {
        if (parent.isValid() || column != 0 || row < 0 || row >= rowCount())
            return QModelIndex();
        return createIndex(row, column);
    }
    QModelIndex parent(const QModelIndex &) const override { return QModelIndex(); }
    int columnCount(const QModelIndex &parent = QModelIndex()) const override { return parent.isValid() ? 0 : 1; }
};
