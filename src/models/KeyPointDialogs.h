#pragma once

#include <QFont>
#include <QString>

// The dialogs that editing a key point may open. This base answers as if the user
// cancelled; the window puts the toolkit's dialogs in its place, tests their own.
class KeyPointDialogs
{
public:
    virtual ~KeyPointDialogs() = default;

    // `font` holds the current font on the way in and the chosen one on the way out.
    virtual bool chooseFont(QFont &font)
    {
        Q_UNUSED(font)
        return false;
    }
    // A picture of the user's own as waypoint symbol; `current` is the present symbol.
    virtual bool choosePicture(QString &fileName, const QString &current)
    {
        Q_UNUSED(fileName)
        Q_UNUSED(current)
        return false;
    }
};
