<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="nl_NL">
<context>
    <name>AvatarGrid</name>
    <message>
        <source>Delete this avatar</source>
        <translation>Deze avatar verwijderen</translation>
    </message>
</context>
<context>
    <name>AvatarSettingsPage</name>
    <message>
        <source>Size</source>
        <translation>Grootte</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Turn with the road</source>
        <translation>Meedraaien met de weg</translation>
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
        <translation>Er is iets misgegaan</translation>
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
        <translation>Lengte, van de langste film</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Longest film</source>
        <translation>Langste film</translation>
    </message>
    <message>
        <source>Even pace over the whole route</source>
        <translation>Gelijkmatig tempo over de hele route</translation>
    </message>
    <message>
        <source>Waypoints</source>
        <translation>Routepunten</translation>
    </message>
    <message>
        <source>Appear when reached</source>
        <translation>Verschijnen bij aankomst</translation>
    </message>
    <message>
        <source>Pop up</source>
        <translation>Laten opspringen</translation>
    </message>
    <message>
        <source>Pop-up time</source>
        <translation>Duur van het opspringen</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>No stops at waypoints</source>
        <translation>Niet stoppen bij routepunten</translation>
    </message>
    <message>
        <source>Camera</source>
        <translation>Camera</translation>
    </message>
    <message>
        <source>Still</source>
        <extracomment>The camera stays where the user left the map</extracomment>
        <translation>Vast</translation>
    </message>
    <message>
        <source>Follow</source>
        <extracomment>The camera keeps the avatar in the middle</extracomment>
        <translation>Volgen</translation>
    </message>
    <message>
        <source>Circle</source>
        <extracomment>The camera follows, the map seen through a round frame</extracomment>
        <translation>Cirkel</translation>
    </message>
    <message>
        <source>Frame</source>
        <extracomment>The camera follows, the map seen through a frame of a chosen shape</extracomment>
        <translation>Kader</translation>
    </message>
    <message>
        <source>Fly in at the start</source>
        <translation>Aan het begin invliegen</translation>
    </message>
    <message>
        <source>Fly-in</source>
        <translation>Invliegen</translation>
    </message>
    <message>
        <source>Turn on the way</source>
        <translation>Onderweg draaien</translation>
    </message>
    <message>
        <source>Turn by</source>
        <translation>Draaien met</translation>
    </message>
    <message>
        <source>%1°</source>
        <translation>%1°</translation>
    </message>
    <message>
        <source>Tilt on the way</source>
        <translation>Onderweg kantelen</translation>
    </message>
    <message>
        <source>Tilt to</source>
        <translation>Kantelen tot</translation>
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
        <translation>Sluiten</translation>
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
        <translation>%1 Z</translation>
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
        <translation>Alle animaties</translation>
    </message>
    <message>
        <source>All archives</source>
        <translation>Alle archieven</translation>
    </message>
    <message>
        <source>All pictures</source>
        <translation>Alle afbeeldingen</translation>
    </message>
    <message>
        <source>All supported files</source>
        <translation>Alle ondersteunde bestanden</translation>
    </message>
    <message>
        <source>Choose a map or picture of your own</source>
        <translation>Eigen kaart of afbeelding kiezen</translation>
    </message>
    <message>
        <source>Save the film as</source>
        <translation>Film opslaan als</translation>
    </message>
    <message>
        <source>Deutsch</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <extracomment>Title of a new waypoint, followed by its number</extracomment>
        <translation>Routepunt</translation>
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
        <translation>De route kon niet als GPX-bestand worden opgeslagen.</translation>
    </message>
    <message>
        <source>This file could not be opened. It is neither a project nor a track that Tourlet can read.</source>
        <translation>Dit bestand kon niet worden geopend. Het is geen project en geen track die Tourlet kan lezen.</translation>
    </message>
    <message>
        <source>There is not enough memory to finish this.</source>
        <translation>Er is niet genoeg geheugen om dit af te ronden.</translation>
    </message>
    <message>
        <source>The file could not be opened.</source>
        <translation>Het bestand kon niet worden geopend.</translation>
    </message>
    <message>
        <source>The file is damaged or built in a way that Tourlet does not know.</source>
        <translation>Het bestand is beschadigd of op een manier opgebouwd die Tourlet niet kent.</translation>
    </message>
    <message>
        <source>The video components that the export needs are missing on this computer.</source>
        <translation>Op deze computer ontbreken de videocomponenten die voor de export nodig zijn.</translation>
    </message>
    <message>
        <source>The film could not be exported.</source>
        <translation>De film kon niet worden geëxporteerd.</translation>
    </message>
    <message>
        <source>MP4 video (H.264)</source>
        <translation>MP4-video (H.264)</translation>
    </message>
    <message>
        <source>WMV video</source>
        <translation>WMV-video</translation>
    </message>
    <message>
        <source>4K (3840 × 2160)</source>
        <translation>4K (3840 × 2160)</translation>
    </message>
    <message>
        <source>Size of the window</source>
        <translation>Venstergrootte</translation>
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
        <translation>Bestandsdatum</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>Bestandsnaam</translation>
    </message>
    <message>
        <source>Automatic</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Automatisch</translation>
    </message>
    <message>
        <source>Standard</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Standaard</translation>
    </message>
    <message>
        <source>Strong</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Sterk</translation>
    </message>
    <message>
        <source>Off</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Uit</translation>
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
        <translation>Hoogteprofielthema openen</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Openen</translation>
    </message>
    <message>
        <source>Loading</source>
        <extracomment>Shown while a file loads, followed by the share done in percent</extracomment>
        <translation>Bezig met laden</translation>
    </message>
    <message>
        <source>10 minutes</source>
        <translation>10 minuten</translation>
    </message>
    <message>
        <source>1 minute</source>
        <translation>1 minuut</translation>
    </message>
    <message>
        <source>30 minutes</source>
        <translation>30 minuten</translation>
    </message>
    <message>
        <source>5 minutes</source>
        <translation>5 minuten</translation>
    </message>
    <message>
        <source>60 minutes</source>
        <translation>60 minuten</translation>
    </message>
    <message>
        <source>Date taken</source>
        <extracomment>Sort photos by the date stored in the photo by the camera</extracomment>
        <translation>Opnamedatum</translation>
    </message>
    <message>
        <source>Nederlands</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Nederlands</translation>
    </message>
    <message>
        <source>Tourlet projects</source>
        <translation>Tourlet-projecten</translation>
    </message>
    <message>
        <source>This project has changes that are not saved yet. Save them before Tourlet closes?</source>
        <translation>Dit project bevat wijzigingen die nog niet zijn opgeslagen. Wilt u ze opslaan voordat Tourlet wordt gesloten?</translation>
    </message>
    <message>
        <source>Save altitude theme</source>
        <translation>Hoogteprofielthema opslaan</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Opslaan</translation>
    </message>
    <message>
        <source>Choose photos</source>
        <translation>Foto&apos;s kiezen</translation>
    </message>
    <message>
        <source>Cut</source>
        <extracomment>Change between photos: straight cut</extracomment>
        <translation>Knip</translation>
    </message>
    <message>
        <source>Fade</source>
        <extracomment>Change between photos: cross-fade</extracomment>
        <translation>Overvloeien</translation>
    </message>
    <message>
        <source>Turn</source>
        <extracomment>Change between photos: the next photo turns in</extracomment>
        <translation>Draaien</translation>
    </message>
    <message>
        <source>Zoom</source>
        <extracomment>Change between photos: the next photo grows from the centre</extracomment>
        <translation>Zoomen</translation>
    </message>
</context>
<context>
    <name>MapView</name>
    <message>
        <source>This project has changes that are not saved yet. Save them first?</source>
        <translation>Dit project bevat wijzigingen die nog niet zijn opgeslagen. Eerst opslaan?</translation>
    </message>
    <message>
        <source>Delete this avatar?</source>
        <translation>Deze avatar verwijderen?</translation>
    </message>
</context>
<context>
    <name>MessageBox</name>
    <message>
        <source>Save</source>
        <translation>Opslaan</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuleren</translation>
    </message>
    <message>
        <source>Don&apos;t save</source>
        <translation>Niet opslaan</translation>
    </message>
    <message>
        <source>Send the film</source>
        <translation>Film verzenden</translation>
    </message>
    <message>
        <source>Show the tutorial</source>
        <translation>Uitleg tonen</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Verwijderen</translation>
    </message>
    <message>
        <source>Open the system settings</source>
        <translation>Systeeminstellingen openen</translation>
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
        <translation>Bezig met zoeken…</translation>
    </message>
    <message>
        <source>Place search needs an internet connection.</source>
        <translation>Zoeken naar plaatsen vereist een internetverbinding.</translation>
    </message>
    <message>
        <source>No place found for “%1”.</source>
        <translation>Geen plaats gevonden voor ‘%1’.</translation>
    </message>
    <message>
        <source>The place search did not work. Try again later.</source>
        <translation>Het zoeken naar plaatsen is mislukt. Probeer het later opnieuw.</translation>
    </message>
    <message>
        <source>Search a place</source>
        <translation>Plaats zoeken</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Zoekopdracht wissen</translation>
    </message>
</context>
<context>
    <name>ProgressView</name>
    <message>
        <source>Exporting the film</source>
        <translation>Film wordt geëxporteerd</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>Share of the film exported so far</extracomment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Hide window</source>
        <translation>Venster verbergen</translation>
    </message>
    <message>
        <source>Stop export</source>
        <translation>Export stoppen</translation>
    </message>
</context>
<context>
    <name>ProjectToolBar</name>
    <message>
        <source>New project</source>
        <translation>Nieuw project</translation>
    </message>
    <message>
        <source>Open project</source>
        <translation>Project openen</translation>
    </message>
    <message>
        <source>Open track</source>
        <translation>Track openen</translation>
    </message>
    <message>
        <source>Save project</source>
        <translation>Project opslaan</translation>
    </message>
    <message>
        <source>Export route as GPX</source>
        <translation>Route als GPX exporteren</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Taal</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Volledig scherm</translation>
    </message>
    <message>
        <source>Route and waypoints</source>
        <translation>Route en routepunten</translation>
    </message>
</context>
<context>
    <name>RouteSettingsPage</name>
    <message>
        <source>Straight</source>
        <extracomment>How the route runs between waypoints: straight lines</extracomment>
        <translation>Recht</translation>
    </message>
    <message>
        <source>Curved</source>
        <extracomment>How the route runs between waypoints: a smooth curve</extracomment>
        <translation>Gebogen</translation>
    </message>
    <message>
        <source>Flight</source>
        <extracomment>How the route runs between waypoints: arcs like a flight</extracomment>
        <translation>Vlucht</translation>
    </message>
    <message>
        <source>Route</source>
        <extracomment>How the route runs between waypoints: as a route of straight legs, not drawn as a curve</extracomment>
        <translation>Route</translation>
    </message>
    <message>
        <source>Course</source>
        <translation>Verloop</translation>
    </message>
    <message>
        <source>A recorded track keeps its course.</source>
        <translation>Een opgenomen track behoudt zijn verloop.</translation>
    </message>
    <message>
        <source>Colour</source>
        <translation>Kleur</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Breedte</translation>
    </message>
    <message>
        <source>%1 px</source>
        <extracomment>A width in pixels on the screen</extracomment>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>Dekking</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Shadow under the route</source>
        <translation>Schaduw onder de route</translation>
    </message>
    <message>
        <source>Shadow distance</source>
        <translation>Afstand van de schaduw</translation>
    </message>
    <message>
        <source>Shadow width</source>
        <translation>Breedte van de schaduw</translation>
    </message>
    <message>
        <source>Shadow opacity</source>
        <translation>Dekking van de schaduw</translation>
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
        <translation>Routepunt</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Sluiten</translation>
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
        <translation>Voorbeeld stoppen</translation>
    </message>
    <message>
        <source>Play the preview</source>
        <translation>Voorbeeld afspelen</translation>
    </message>
    <message>
        <source>Position in the film</source>
        <translation>Positie in de film</translation>
    </message>
    <message>
        <source>Settings of the film</source>
        <translation>Instellingen van de film</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Volledig scherm</translation>
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
        <translation>Klik op een routepunt op de kaart om het te wijzigen.</translation>
    </message>
    <message>
        <source>No waypoints yet. Click on the map to set one, or search for a place.</source>
        <translation>Nog geen routepunten. Klik op de kaart om er een te plaatsen, of zoek een plaats.</translation>
    </message>
    <message>
        <source>This waypoint</source>
        <translation>Dit routepunt</translation>
    </message>
    <message>
        <source>All waypoints</source>
        <translation>Alle routepunten</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>Titel</translation>
    </message>
    <message>
        <source>Symbol</source>
        <translation>Symbool</translation>
    </message>
    <message>
        <source>Size</source>
        <translation>Grootte</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>A size in percent of the normal size</extracomment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Timing</source>
        <translation>Tijden</translation>
    </message>
    <message>
        <source>Stop at the waypoint</source>
        <translation>Stop bij het routepunt</translation>
    </message>
    <message>
        <source>On the way to the next one</source>
        <translation>Onderweg naar het volgende</translation>
    </message>
    <message>
        <source>Caption</source>
        <translation>Bijschrift</translation>
    </message>
    <message>
        <source>Font: %1, %2 pt…</source>
        <extracomment>Opens the choice of a font; %1 is the font&apos;s name, %2 its size in points</extracomment>
        <translation>Lettertype: %1, %2 pt…</translation>
    </message>
    <message>
        <source>Font…</source>
        <translation>Lettertype…</translation>
    </message>
    <message>
        <source>Frame behind the caption</source>
        <translation>Kader achter het bijschrift</translation>
    </message>
    <message>
        <source>Shadow under the caption</source>
        <translation>Schaduw onder het bijschrift</translation>
    </message>
    <message>
        <source>Show all waypoints</source>
        <translation>Alle routepunten tonen</translation>
    </message>
    <message>
        <source>Show this waypoint</source>
        <translation>Dit routepunt tonen</translation>
    </message>
    <message>
        <source>Delete waypoint</source>
        <translation>Routepunt verwijderen</translation>
    </message>
</context>
</TS>
