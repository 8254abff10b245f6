#pragma once

#include <QString>
#include <QVariantMap>

// The look of the drawn route.
struct PathSettings
{
    QString color = QStringLiteral("#FF0000");
    double opacity = 0.8;
    int32_t width = 6;
    bool shadowEnabled = false;
    double shadowDistance = 3.0;
    int32_t shadowWidth = 6;
    double shadowOpacity = 0.8;

    QVariantMap toMap() const;
    // Takes the keys that are present; others keep their value.
    void fromMap(const QVariantMap &map);
};
