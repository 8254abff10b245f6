import QtQml 2.15

// The texts that the native side shows in its own dialogs, file filters and lists.
// It holds no translations of its own: it reads them from this table, handed over
// whole through host.strHostStrings and again after every change of language.
QtObject {
    function table() {
        return {
            "strAllAnimationfiles": qsTr("All animations"),
            "strAllCompressedfiles": qsTr("All archives"),
            "strAllImagefiles": qsTr("All pictures"),
            "strAllSupportedfiles": qsTr("All supported files"),
            "strBrowseOwnContent": qsTr("Choose a map or picture of your own"),
            "strChooseExportPath": qsTr("Save the film as"),
            //: Name of the language in the language itself; keep it unchanged in every translation
            "strDEde": qsTr("Deutsch"),
            //: Title of a new waypoint, followed by its number
            "strDefaultKeypointTitle": qsTr("Waypoint"),
            //: Name of the language in the language itself; keep it unchanged in every translation
            "strENen": qsTr("English"),
            //: Name of the language in the language itself; keep it unchanged in every translation
            "strESes": qsTr("Español"),
            "strErrorCantExportGPX": qsTr("The route could not be saved as a GPX file."),
            "strErrorCantLoadProject": qsTr("This file could not be opened. It is neither a project nor a track that Tourlet can read."),
            "strErrorNoMemory": qsTr("There is not enough memory to finish this."),
            "strErrorOpenFile": qsTr("The file could not be opened."),
            "strErrorWrongFileStructure": qsTr("The file is damaged or built in a way that Tourlet does not know."),
            "strExportErrorNoMediaFoundation": qsTr("The video components that the export needs are missing on this computer."),
            "strExportErrorUnknwon": qsTr("The film could not be exported."),
            "strExportFormatMP4": qsTr("MP4 video (H.264)"),
            "strExportFormatWMV": qsTr("WMV video"),
            "strExportResolution4K": qsTr("4K (3840 × 2160)"),
            "strExportResolutionCurrent": qsTr("Size of the window"),
            "strExportResolutionFullHD": qsTr("Full HD (1920 × 1080)"),
            //: Name of the language in the language itself; keep it unchanged in every translation
            "strFRfr": qsTr("Français"),
            "strFileDate": qsTr("Date of the file"),
            "strFileName": qsTr("File name"),
            //: Smoothing of recorded tracks
            "strGPXAliasingAuto": qsTr("Automatic"),
            //: Smoothing of recorded tracks
            "strGPXAliasingDefault": qsTr("Standard"),
            //: Smoothing of recorded tracks
            "strGPXAliasingMax": qsTr("Strong"),
            //: Smoothing of recorded tracks
            "strGPXAliasingOff": qsTr("Off"),
            //: Name of the language in the language itself; keep it unchanged in every translation
            "strITit": qsTr("Italiano"),
            //: Name of the language in the language itself; keep it unchanged in every translation
            "strJPja": qsTr("日本語"),
            "strLoadPreset": qsTr("Open altitude theme"),
            "strLoadProject": qsTr("Open"),
            //: Shown while a file loads, followed by the share done in percent
            "strLoadProjectHint": qsTr("Loading"),
            "strMaxAnimationDuration10Min": qsTr("10 minutes"),
            "strMaxAnimationDuration1Min": qsTr("1 minute"),
            "strMaxAnimationDuration30Min": qsTr("30 minutes"),
            "strMaxAnimationDuration5Min": qsTr("5 minutes"),
            "strMaxAnimationDuration60Min": qsTr("60 minutes"),
            //: Sort photos by the date stored in the photo by the camera
            "strMetaDate": qsTr("Date taken"),
            //: Name of the language in the language itself; keep it unchanged in every translation
            "strNLnl": qsTr("Nederlands"),
            "strProjectfiles": qsTr("Tourlet projects"),
            "strSaveOnCloseProjectHint": qsTr("This project has changes that are not saved yet. Save them before Tourlet closes?"),
            "strSavePreset": qsTr("Save altitude theme"),
            "strSaveProject": qsTr("Save"),
            "strSelecteUserPhotos": qsTr("Choose photos"),
            //: Change between photos: straight cut
            "strTransitionCut": qsTr("Cut"),
            //: Change between photos: cross-fade
            "strTransitionFade": qsTr("Fade"),
            //: Change between photos: the next photo turns in
            "strTransitionRotation": qsTr("Turn"),
            //: Change between photos: the next photo grows from the centre
            "strTransitionZoom": qsTr("Zoom")
        }
    }
}
