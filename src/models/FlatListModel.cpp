#include "models/FlatListModel.h"

#include "app/Trace.h"

#include <QMetaMethod>

namespace {

int methodIndexByName(const QMetaObject *meta, QMetaMethod::MethodType type, const QByteArray &name)
{
    for (int i = meta->methodOffset(); i < meta->methodCount(); ++i) {
        const QMetaMethod method = meta->method(i);
        if (method.methodType() == type && method.name() == name)
            return i;
    }
    return -1;
}

} // namespace

void FlatListModel::connectSignalsByName(QObject *root, const QString &objectName,
                                         std::initializer_list<const char *> names)
{
    QObject *list = root ? root->findChild<QObject *>(objectName) : nullptr;
    if (!list)
        return;
    const QMetaObject *theirs = list->metaObject();
    const QMetaObject *ours = metaObject();
    for (const char *name : names) {
        // The interface declares its own signals, so they lie beyond its base classes.
        const int signal = methodIndexByName(theirs, QMetaMethod::Signal, name);
        const int slot = methodIndexByName(ours, QMetaMethod::Slot, name);
        if (signal < 0 || slot < 0)
            continue;
        if (!connect(list, theirs->method(signal), this, ours->method(slot)))
            logTrace(3, QStringLiteral("%s::connectSignalList: %s not connected"), ours->className(), name);
    }
}
