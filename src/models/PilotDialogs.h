#pragma once

#include <QString>

// The file dialog that adds an avatar of the user's own. This base answers as if
// the user cancelled; the window puts the toolkit's dialog in its place, tests their own.
class PilotDialogs
{
public:
    virtual ~PilotDialogs() = default;

    // A picture, or a zip of a picture series; empty when cancelled. `folder` is
    // where the dialog opens.
    virtual QString chooseAvatarFile(const QString &folder)
    {
        Q_UNUSED(folder)
        return QString();
    }
};
