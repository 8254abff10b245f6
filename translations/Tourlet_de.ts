<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>AvatarGrid</name>
    <message>
        <source>Delete this avatar</source>
        <translation>Diesen Avatar löschen</translation>
    </message>
</context>
<context>
    <name>AvatarSettingsPage</name>
    <message>
        <source>Size</source>
        <translation>Größe</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Turn with the road</source>
        <translation>Mit der Straße drehen</translation>
    </message>
</context>
<context>
    <name>DurationField</name>
    <message>
        <source>s</source>
        <extracomment>Unit after a duration field: seconds</extracomment>
        <translation>s</translation>
    </message>
</context>
<context>
    <name>ErrorBox</name>
    <message>
        <source>Something went wrong</source>
        <translation>Etwas ist schiefgegangen</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>FilmSettingsPage</name>
    <message>
        <source>Length, of the longest film</source>
        <translation>Länge, vom längsten Film</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Longest film</source>
        <translation>Längster Film</translation>
    </message>
    <message>
        <source>Even pace over the whole route</source>
        <translation>Gleichmäßiges Tempo</translation>
    </message>
    <message>
        <source>Waypoints</source>
        <translation>Wegpunkte</translation>
    </message>
    <message>
        <source>Appear when reached</source>
        <translation>Beim Erreichen einblenden</translation>
    </message>
    <message>
        <source>Pop up</source>
        <translation>Aufspringen lassen</translation>
    </message>
    <message>
        <source>Pop-up time</source>
        <translation>Dauer des Aufspringens</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>No stops at waypoints</source>
        <translation>Nicht an Wegpunkten halten</translation>
    </message>
    <message>
        <source>Camera</source>
        <translation>Kamera</translation>
    </message>
    <message>
        <source>Still</source>
        <extracomment>The camera stays where the user left the map</extracomment>
        <translation>Fest</translation>
    </message>
    <message>
        <source>Follow</source>
        <extracomment>The camera keeps the avatar in the middle</extracomment>
        <translation>Folgen</translation>
    </message>
    <message>
        <source>Circle</source>
        <extracomment>The camera follows, the map seen through a round frame</extracomment>
        <translation>Kreis</translation>
    </message>
    <message>
        <source>Frame</source>
        <extracomment>The camera follows, the map seen through a frame of a chosen shape</extracomment>
        <translation>Rahmen</translation>
    </message>
    <message>
        <source>Fly in at the start</source>
        <translation>Zu Beginn einfliegen</translation>
    </message>
    <message>
        <source>Fly-in</source>
        <translation>Anflug</translation>
    </message>
    <message>
        <source>Turn on the way</source>
        <translation>Unterwegs drehen</translation>
    </message>
    <message>
        <source>Turn by</source>
        <translation>Drehen um</translation>
    </message>
    <message>
        <source>%1°</source>
        <translation>%1°</translation>
    </message>
    <message>
        <source>Tilt on the way</source>
        <translation>Unterwegs neigen</translation>
    </message>
    <message>
        <source>Tilt to</source>
        <translation>Neigen auf</translation>
    </message>
</context>
<context>
    <name>FilmSettingsPanel</name>
    <message>
        <source>Film</source>
        <translation>Film</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>Graticule</name>
    <message>
        <source>%1 N</source>
        <extracomment>Latitude north of the equator; %1 is the angle, such as 51°12′</extracomment>
        <translation>%1 N</translation>
    </message>
    <message>
        <source>%1 S</source>
        <extracomment>Latitude south of the equator; %1 is the angle, such as 51°12′</extracomment>
        <translation>%1 S</translation>
    </message>
    <message>
        <source>%1 E</source>
        <extracomment>Longitude east of Greenwich; %1 is the angle, such as 13°30′</extracomment>
        <translation>%1 O</translation>
    </message>
    <message>
        <source>%1 W</source>
        <extracomment>Longitude west of Greenwich; %1 is the angle, such as 13°30′</extracomment>
        <translation>%1 W</translation>
    </message>
</context>
<context>
    <name>HintBox</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>HostStrings</name>
    <message>
        <source>All animations</source>
        <translation>Alle Animationen</translation>
    </message>
    <message>
        <source>All archives</source>
        <translation>Alle Archive</translation>
    </message>
    <message>
        <source>All pictures</source>
        <translation>Alle Bilder</translation>
    </message>
    <message>
        <source>All supported files</source>
        <translation>Alle unterstützten Dateien</translation>
    </message>
    <message>
        <source>Choose a map or picture of your own</source>
        <translation>Eigene Karte oder eigenes Bild wählen</translation>
    </message>
    <message>
        <source>Save the film as</source>
        <translation>Film speichern unter</translation>
    </message>
    <message>
        <source>Deutsch</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <extracomment>Title of a new waypoint, followed by its number</extracomment>
        <translation>Wegpunkt</translation>
    </message>
    <message>
        <source>English</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>English</translation>
    </message>
    <message>
        <source>Español</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Español</translation>
    </message>
    <message>
        <source>The route could not be saved as a GPX file.</source>
        <translation>Die Route konnte nicht als GPX-Datei gespeichert werden.</translation>
    </message>
    <message>
        <source>This file could not be opened. It is neither a project nor a track that Tourlet can read.</source>
        <translation>Diese Datei konnte nicht geöffnet werden. Sie ist weder ein Projekt noch ein Track, den Tourlet lesen kann.</translation>
    </message>
    <message>
        <source>There is not enough memory to finish this.</source>
        <translation>Der Arbeitsspeicher reicht nicht aus, um dies abzuschließen.</translation>
    </message>
    <message>
        <source>The file could not be opened.</source>
        <translation>Die Datei konnte nicht geöffnet werden.</translation>
    </message>
    <message>
        <source>The file is damaged or built in a way that Tourlet does not know.</source>
        <translation>Die Datei ist beschädigt oder auf eine Weise aufgebaut, die Tourlet nicht kennt.</translation>
    </message>
    <message>
        <source>The video components that the export needs are missing on this computer.</source>
        <translation>Auf diesem Computer fehlen die Videokomponenten, die der Export benötigt.</translation>
    </message>
    <message>
        <source>The film could not be exported.</source>
        <translation>Der Film konnte nicht exportiert werden.</translation>
    </message>
    <message>
        <source>MP4 video (H.264)</source>
        <translation>MP4-Video (H.264)</translation>
    </message>
    <message>
        <source>WMV video</source>
        <translation>WMV-Video</translation>
    </message>
    <message>
        <source>4K (3840 × 2160)</source>
        <translation>4K (3840 × 2160)</translation>
    </message>
    <message>
        <source>Size of the window</source>
        <translation>Fenstergröße</translation>
    </message>
    <message>
        <source>Full HD (1920 × 1080)</source>
        <translation>Full HD (1920 × 1080)</translation>
    </message>
    <message>
        <source>Français</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Français</translation>
    </message>
    <message>
        <source>Date of the file</source>
        <translation>Dateidatum</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>Dateiname</translation>
    </message>
    <message>
        <source>Automatic</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Automatisch</translation>
    </message>
    <message>
        <source>Standard</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Standard</translation>
    </message>
    <message>
        <source>Strong</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Stark</translation>
    </message>
    <message>
        <source>Off</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Aus</translation>
    </message>
    <message>
        <source>Italiano</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Italiano</translation>
    </message>
    <message>
        <source>日本語</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>日本語</translation>
    </message>
    <message>
        <source>Open altitude theme</source>
        <translation>Höhenprofil-Vorlage öffnen</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Öffnen</translation>
    </message>
    <message>
        <source>Loading</source>
        <extracomment>Shown while a file loads, followed by the share done in percent</extracomment>
        <translation>Wird geladen</translation>
    </message>
    <message>
        <source>10 minutes</source>
        <translation>10 Minuten</translation>
    </message>
    <message>
        <source>1 minute</source>
        <translation>1 Minute</translation>
    </message>
    <message>
        <source>30 minutes</source>
        <translation>30 Minuten</translation>
    </message>
    <message>
        <source>5 minutes</source>
        <translation>5 Minuten</translation>
    </message>
    <message>
        <source>60 minutes</source>
        <translation>60 Minuten</translation>
    </message>
    <message>
        <source>Date taken</source>
        <extracomment>Sort photos by the date stored in the photo by the camera</extracomment>
        <translation>Aufnahmedatum</translation>
    </message>
    <message>
        <source>Nederlands</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Nederlands</translation>
    </message>
    <message>
        <source>Tourlet projects</source>
        <translation>Tourlet-Projekte</translation>
    </message>
    <message>
        <source>This project has changes that are not saved yet. Save them before Tourlet closes?</source>
        <translation>Dieses Projekt enthält Änderungen, die noch nicht gespeichert sind. Sollen sie gespeichert werden, bevor Tourlet beendet wird?</translation>
    </message>
    <message>
        <source>Save altitude theme</source>
        <translation>Höhenprofil-Vorlage speichern</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Choose photos</source>
        <translation>Fotos auswählen</translation>
    </message>
    <message>
        <source>Cut</source>
        <extracomment>Change between photos: straight cut</extracomment>
        <translation>Schnitt</translation>
    </message>
    <message>
        <source>Fade</source>
        <extracomment>Change between photos: cross-fade</extracomment>
        <translation>Überblenden</translation>
    </message>
    <message>
        <source>Turn</source>
        <extracomment>Change between photos: the next photo turns in</extracomment>
        <translation>Drehen</translation>
    </message>
    <message>
        <source>Zoom</source>
        <extracomment>Change between photos: the next photo grows from the centre</extracomment>
        <translation>Zoom</translation>
    </message>
</context>
<context>
    <name>MapView</name>
    <message>
        <source>This project has changes that are not saved yet. Save them first?</source>
        <translation>Dieses Projekt enthält Änderungen, die noch nicht gespeichert sind. Zuerst speichern?</translation>
    </message>
    <message>
        <source>Delete this avatar?</source>
        <translation>Diesen Avatar löschen?</translation>
    </message>
</context>
<context>
    <name>MessageBox</name>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Don&apos;t save</source>
        <translation>Nicht speichern</translation>
    </message>
    <message>
        <source>Send the film</source>
        <translation>Film senden</translation>
    </message>
    <message>
        <source>Show the tutorial</source>
        <translation>Einführung zeigen</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Open the system settings</source>
        <translation>Systemeinstellungen öffnen</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>PlaceSearch</name>
    <message>
        <source>Searching…</source>
        <translation>Suche läuft…</translation>
    </message>
    <message>
        <source>Place search needs an internet connection.</source>
        <translation>Die Ortssuche braucht eine Internetverbindung.</translation>
    </message>
    <message>
        <source>No place found for “%1”.</source>
        <translation>Kein Ort gefunden für „%1“.</translation>
    </message>
    <message>
        <source>The place search did not work. Try again later.</source>
        <translation>Die Ortssuche hat nicht funktioniert. Später noch einmal versuchen.</translation>
    </message>
    <message>
        <source>Search a place</source>
        <translation>Ort suchen</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Suche leeren</translation>
    </message>
</context>
<context>
    <name>ProgressView</name>
    <message>
        <source>Exporting the film</source>
        <translation>Film wird exportiert</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>Share of the film exported so far</extracomment>
        <translation>%1&#xa0;%</translation>
    </message>
    <message>
        <source>Hide window</source>
        <translation>Fenster ausblenden</translation>
    </message>
    <message>
        <source>Stop export</source>
        <translation>Export abbrechen</translation>
    </message>
</context>
<context>
    <name>ProjectToolBar</name>
    <message>
        <source>New project</source>
        <translation>Neues Projekt</translation>
    </message>
    <message>
        <source>Open project</source>
        <translation>Projekt öffnen</translation>
    </message>
    <message>
        <source>Open track</source>
        <translation>Track öffnen</translation>
    </message>
    <message>
        <source>Save project</source>
        <translation>Projekt speichern</translation>
    </message>
    <message>
        <source>Export route as GPX</source>
        <translation>Route als GPX exportieren</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Vollbild</translation>
    </message>
    <message>
        <source>Route and waypoints</source>
        <translation>Route und Wegpunkte</translation>
    </message>
</context>
<context>
    <name>RouteSettingsPage</name>
    <message>
        <source>Straight</source>
        <extracomment>How the route runs between waypoints: straight lines</extracomment>
        <translation>Gerade</translation>
    </message>
    <message>
        <source>Curved</source>
        <extracomment>How the route runs between waypoints: a smooth curve</extracomment>
        <translation>Kurvig</translation>
    </message>
    <message>
        <source>Flight</source>
        <extracomment>How the route runs between waypoints: arcs like a flight</extracomment>
        <translation>Flug</translation>
    </message>
    <message>
        <source>Route</source>
        <extracomment>How the route runs between waypoints: as a route of straight legs, not drawn as a curve</extracomment>
        <translation>Route</translation>
    </message>
    <message>
        <source>Course</source>
        <translation>Verlauf</translation>
    </message>
    <message>
        <source>A recorded track keeps its course.</source>
        <translation>Ein aufgezeichneter Track behält seinen Verlauf.</translation>
    </message>
    <message>
        <source>Colour</source>
        <translation>Farbe</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Breite</translation>
    </message>
    <message>
        <source>%1 px</source>
        <extracomment>A width in pixels on the screen</extracomment>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>Deckkraft</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Shadow under the route</source>
        <translation>Schatten unter der Route</translation>
    </message>
    <message>
        <source>Shadow distance</source>
        <translation>Abstand des Schattens</translation>
    </message>
    <message>
        <source>Shadow width</source>
        <translation>Breite des Schattens</translation>
    </message>
    <message>
        <source>Shadow opacity</source>
        <translation>Deckkraft des Schattens</translation>
    </message>
</context>
<context>
    <name>SettingsPanel</name>
    <message>
        <source>Route</source>
        <translation>Route</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <translation>Wegpunkt</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Avatar</source>
        <translation>Avatar</translation>
    </message>
</context>
<context>
    <name>TimelineBar</name>
    <message>
        <source>Stop the preview</source>
        <translation>Vorschau anhalten</translation>
    </message>
    <message>
        <source>Play the preview</source>
        <translation>Vorschau abspielen</translation>
    </message>
    <message>
        <source>Position in the film</source>
        <translation>Position im Film</translation>
    </message>
    <message>
        <source>Settings of the film</source>
        <translation>Einstellungen des Films</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Vollbild</translation>
    </message>
</context>
<context>
    <name>ToolBarButton</name>
    <message>
        <source>%1 (%2)</source>
        <translation>%1 (%2)</translation>
    </message>
</context>
<context>
    <name>WaypointSettingsPage</name>
    <message>
        <source>Click a waypoint on the map to change it.</source>
        <translation>Zum Ändern einen Wegpunkt auf der Karte anklicken.</translation>
    </message>
    <message>
        <source>No waypoints yet. Click on the map to set one, or search for a place.</source>
        <translation>Noch keine Wegpunkte. Auf die Karte klicken, um einen zu setzen, oder einen Ort suchen.</translation>
    </message>
    <message>
        <source>This waypoint</source>
        <translation>Dieser Wegpunkt</translation>
    </message>
    <message>
        <source>All waypoints</source>
        <translation>Alle Wegpunkte</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>Titel</translation>
    </message>
    <message>
        <source>Symbol</source>
        <translation>Symbol</translation>
    </message>
    <message>
        <source>Size</source>
        <translation>Größe</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>A size in percent of the normal size</extracomment>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Timing</source>
        <translation>Zeiten</translation>
    </message>
    <message>
        <source>Stop at the waypoint</source>
        <translation>Halt am Wegpunkt</translation>
    </message>
    <message>
        <source>On the way to the next one</source>
        <translation>Weg zum nächsten</translation>
    </message>
    <message>
        <source>Caption</source>
        <translation>Beschriftung</translation>
    </message>
    <message>
        <source>Font: %1, %2 pt…</source>
        <extracomment>Opens the choice of a font; %1 is the font&apos;s name, %2 its size in points</extracomment>
        <translation>Schrift: %1, %2 pt…</translation>
    </message>
    <message>
        <source>Font…</source>
        <translation>Schrift…</translation>
    </message>
    <message>
        <source>Frame behind the caption</source>
        <translation>Rahmen hinter der Beschriftung</translation>
    </message>
    <message>
        <source>Shadow under the caption</source>
        <translation>Schatten unter der Beschriftung</translation>
    </message>
    <message>
        <source>Show all waypoints</source>
        <translation>Alle Wegpunkte zeigen</translation>
    </message>
    <message>
        <source>Show this waypoint</source>
        <translation>Diesen Wegpunkt zeigen</translation>
    </message>
    <message>
        <source>Delete waypoint</source>
        <translation>Wegpunkt löschen</translation>
    </message>
</context>
</TS>
