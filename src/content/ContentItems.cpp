#include "content/ContentItems.h"

uint32_t nextContentItemId()
{
    static uint32_t counter = 0;
    return ++counter;
}

QString contentFileUrl(const QString &path)
{
    // An absolute path already brings the slash that the third one stands for.
    const QString rest = path.startsWith(QLatin1Char('/')) ? path.mid(1) : path;
    return QStringLiteral("file:///%1").arg(rest);
}

QVariantMap contentItemMap(const ContentItem &item, uint32_t fieldMask)
{
    QVariantMap map;
    if (fieldMask & ItemMapField::Title)
        map.insert(QStringLiteral("title"), item.name);
    if (fieldMask & ItemMapField::Id)
        map.insert(QStringLiteral("id"), item.id);
    if (fieldMask & ItemMapField::SourceFile)
        map.insert(QStringLiteral("sourceFileName"), contentFileUrl(item.sourceFile));
    if (fieldMask & ItemMapField::ThumbFile)
        map.insert(QStringLiteral("thumbFileName"), contentFileUrl(item.thumbFile));
    if (fieldMask & (ItemMapField::Title | ItemMapField::Group))
        map.insert(QStringLiteral("groupeId"), item.groupIndex);
    if (fieldMask & (ItemMapField::SourceFile | ItemMapField::Group))
        map.insert(QStringLiteral("groupeName"), item.groupName);
    return map;
}
