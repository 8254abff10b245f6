#pragma once

#include <QAbstractItemModel>

#include <initializer_list>

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

protected:
    // Connects each named signal of the interface's object `objectName` under `root` to
    // this model's slot of the same name. Without that object nothing is connected.
    void connectSignalsByName(QObject *root, const QString &objectName, std::initializer_list<const char *> names);
};
