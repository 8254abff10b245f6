#include "path/PathSettings.h"

QVariantMap PathSettings::toMap() const
{
    return {{QStringLiteral("color"), color},
            {QStringLiteral("opacity"), opacity},
            {QStringLiteral("width"), width},
            {QStringLiteral("shadowEnabled"), shadowEnabled},
            {QStringLiteral("shadowDistance"), shadowDistance},
            {QStringLiteral("shadowWidth"), shadowWidth},
            {QStringLiteral("shadowOpacity"), shadowOpacity}};
}

void PathSettings::fromMap(const QVariantMap &map)
{
    color = map.value(QStringLiteral("color"), color).toString();
    opacity = map.value(QStringLiteral("opacity"), opacity).toDouble();
    width = map.value(QStringLiteral("width"), width).toInt();
    shadowEnabled = map.value(QStringLiteral("shadowEnabled"), shadowEnabled).toBool();
    shadowDistance = map.value(QStringLiteral("shadowDistance"), shadowDistance).toDouble();
    shadowWidth = map.value(QStringLiteral("shadowWidth"), shadowWidth).toInt();
    shadowOpacity = map.value(QStringLiteral("shadowOpacity"), shadowOpacity).toDouble();
}
