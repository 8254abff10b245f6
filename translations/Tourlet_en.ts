<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_US">
<context>
    <name>AvatarGrid</name>
    <message>
        <source>Delete this avatar</source>
        <translation>Delete this avatar</translation>
    </message>
</context>
<context>
    <name>AvatarSettingsPage</name>
    <message>
        <source>Size</source>
        <translation>Size</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Turn with the road</source>
        <translation>Turn with the road</translation>
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
        <translation>Something went wrong</translation>
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
        <translation>Length, of the longest film</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Longest film</source>
        <translation>Longest film</translation>
    </message>
    <message>
        <source>Even pace over the whole route</source>
        <translation>Even pace over the whole route</translation>
    </message>
    <message>
        <source>Waypoints</source>
        <translation>Waypoints</translation>
    </message>
    <message>
        <source>Appear when reached</source>
        <translation>Appear when reached</translation>
    </message>
    <message>
        <source>Pop up</source>
        <translation>Pop up</translation>
    </message>
    <message>
        <source>Pop-up time</source>
        <translation>Pop-up time</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>No stops at waypoints</source>
        <translation>No stops at waypoints</translation>
    </message>
    <message>
        <source>Camera</source>
        <translation>Camera</translation>
    </message>
    <message>
        <source>Still</source>
        <extracomment>The camera stays where the user left the map</extracomment>
        <translation>Still</translation>
    </message>
    <message>
        <source>Follow</source>
        <extracomment>The camera keeps the avatar in the middle</extracomment>
        <translation>Follow</translation>
    </message>
    <message>
        <source>Circle</source>
        <extracomment>The camera follows, the map seen through a round frame</extracomment>
        <translation>Circle</translation>
    </message>
    <message>
        <source>Frame</source>
        <extracomment>The camera follows, the map seen through a frame of a chosen shape</extracomment>
        <translation>Frame</translation>
    </message>
    <message>
        <source>Fly in at the start</source>
        <translation>Fly in at the start</translation>
    </message>
    <message>
        <source>Fly-in</source>
        <translation>Fly-in</translation>
    </message>
    <message>
        <source>Turn on the way</source>
        <translation>Turn on the way</translation>
    </message>
    <message>
        <source>Turn by</source>
        <translation>Turn by</translation>
    </message>
    <message>
        <source>%1°</source>
        <translation>%1°</translation>
    </message>
    <message>
        <source>Tilt on the way</source>
        <translation>Tilt on the way</translation>
    </message>
    <message>
        <source>Tilt to</source>
        <translation>Tilt to</translation>
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
        <translation>Close</translation>
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
        <translation>%1 E</translation>
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
        <translation>All animations</translation>
    </message>
    <message>
        <source>All archives</source>
        <translation>All archives</translation>
    </message>
    <message>
        <source>All pictures</source>
        <translation>All pictures</translation>
    </message>
    <message>
        <source>All supported files</source>
        <translation>All supported files</translation>
    </message>
    <message>
        <source>Choose a map or picture of your own</source>
        <translation>Choose a map or picture of your own</translation>
    </message>
    <message>
        <source>Save the film as</source>
        <translation>Save the film as</translation>
    </message>
    <message>
        <source>Deutsch</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <extracomment>Title of a new waypoint, followed by its number</extracomment>
        <translation>Waypoint</translation>
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
        <translation>The route could not be saved as a GPX file.</translation>
    </message>
    <message>
        <source>This file could not be opened. It is neither a project nor a track that Tourlet can read.</source>
        <translation>This file could not be opened. It is neither a project nor a track that Tourlet can read.</translation>
    </message>
    <message>
        <source>There is not enough memory to finish this.</source>
        <translation>There is not enough memory to finish this.</translation>
    </message>
    <message>
        <source>The file could not be opened.</source>
        <translation>The file could not be opened.</translation>
    </message>
    <message>
        <source>The file is damaged or built in a way that Tourlet does not know.</source>
        <translation>The file is damaged or built in a way that Tourlet does not know.</translation>
    </message>
    <message>
        <source>The video components that the export needs are missing on this computer.</source>
        <translation>The video components that the export needs are missing on this computer.</translation>
    </message>
    <message>
        <source>The film could not be exported.</source>
        <translation>The film could not be exported.</translation>
    </message>
    <message>
        <source>MP4 video (H.264)</source>
        <translation>MP4 video (H.264)</translation>
    </message>
    <message>
        <source>WMV video</source>
        <translation>WMV video</translation>
    </message>
    <message>
        <source>4K (3840 × 2160)</source>
        <translation>4K (3840 × 2160)</translation>
    </message>
    <message>
        <source>Size of the window</source>
        <translation>Size of the window</translation>
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
        <translation>Date of the file</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>File name</translation>
    </message>
    <message>
        <source>Automatic</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Automatic</translation>
    </message>
    <message>
        <source>Standard</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Standard</translation>
    </message>
    <message>
        <source>Strong</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Strong</translation>
    </message>
    <message>
        <source>Off</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Off</translation>
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
        <translation>Open altitude theme</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Open</translation>
    </message>
    <message>
        <source>Loading</source>
        <extracomment>Shown while a file loads, followed by the share done in percent</extracomment>
        <translation>Loading</translation>
    </message>
    <message>
        <source>10 minutes</source>
        <translation>10 minutes</translation>
    </message>
    <message>
        <source>1 minute</source>
        <translation>1 minute</translation>
    </message>
    <message>
        <source>30 minutes</source>
        <translation>30 minutes</translation>
    </message>
    <message>
        <source>5 minutes</source>
        <translation>5 minutes</translation>
    </message>
    <message>
        <source>60 minutes</source>
        <translation>60 minutes</translation>
    </message>
    <message>
        <source>Date taken</source>
        <extracomment>Sort photos by the date stored in the photo by the camera</extracomment>
        <translation>Date taken</translation>
    </message>
    <message>
        <source>Nederlands</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Nederlands</translation>
    </message>
    <message>
        <source>Tourlet projects</source>
        <translation>Tourlet projects</translation>
    </message>
    <message>
        <source>This project has changes that are not saved yet. Save them before Tourlet closes?</source>
        <translation>This project has changes that are not saved yet. Save them before Tourlet closes?</translation>
    </message>
    <message>
        <source>Save altitude theme</source>
        <translation>Save altitude theme</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Save</translation>
    </message>
    <message>
        <source>Choose photos</source>
        <translation>Choose photos</translation>
    </message>
    <message>
        <source>Cut</source>
        <extracomment>Change between photos: straight cut</extracomment>
        <translation>Cut</translation>
    </message>
    <message>
        <source>Fade</source>
        <extracomment>Change between photos: cross-fade</extracomment>
        <translation>Fade</translation>
    </message>
    <message>
        <source>Turn</source>
        <extracomment>Change between photos: the next photo turns in</extracomment>
        <translation>Turn</translation>
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
        <translation>This project has changes that are not saved yet. Save them first?</translation>
    </message>
    <message>
        <source>Delete this avatar?</source>
        <translation>Delete this avatar?</translation>
    </message>
</context>
<context>
    <name>MessageBox</name>
    <message>
        <source>Save</source>
        <translation>Save</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Don&apos;t save</source>
        <translation>Don&apos;t save</translation>
    </message>
    <message>
        <source>Send the film</source>
        <translation>Send the film</translation>
    </message>
    <message>
        <source>Show the tutorial</source>
        <translation>Show the tutorial</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>Open the system settings</source>
        <translation>Open the system settings</translation>
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
        <translation>Searching…</translation>
    </message>
    <message>
        <source>Place search needs an internet connection.</source>
        <translation>Place search needs an internet connection.</translation>
    </message>
    <message>
        <source>No place found for “%1”.</source>
        <translation>No place found for “%1”.</translation>
    </message>
    <message>
        <source>The place search did not work. Try again later.</source>
        <translation>The place search did not work. Try again later.</translation>
    </message>
    <message>
        <source>Search a place</source>
        <translation>Search a place</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Clear the search</translation>
    </message>
</context>
<context>
    <name>ProgressView</name>
    <message>
        <source>Exporting the film</source>
        <translation>Exporting the film</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>Share of the film exported so far</extracomment>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Hide window</source>
        <translation>Hide window</translation>
    </message>
    <message>
        <source>Stop export</source>
        <translation>Stop export</translation>
    </message>
</context>
<context>
    <name>ProjectToolBar</name>
    <message>
        <source>New project</source>
        <translation>New project</translation>
    </message>
    <message>
        <source>Open project</source>
        <translation>Open project</translation>
    </message>
    <message>
        <source>Open track</source>
        <translation>Open track</translation>
    </message>
    <message>
        <source>Save project</source>
        <translation>Save project</translation>
    </message>
    <message>
        <source>Export route as GPX</source>
        <translation>Export route as GPX</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Language</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Full screen</translation>
    </message>
    <message>
        <source>Route and waypoints</source>
        <translation>Route and waypoints</translation>
    </message>
</context>
<context>
    <name>RouteSettingsPage</name>
    <message>
        <source>Straight</source>
        <extracomment>How the route runs between waypoints: straight lines</extracomment>
        <translation>Straight</translation>
    </message>
    <message>
        <source>Curved</source>
        <extracomment>How the route runs between waypoints: a smooth curve</extracomment>
        <translation>Curved</translation>
    </message>
    <message>
        <source>Flight</source>
        <extracomment>How the route runs between waypoints: arcs like a flight</extracomment>
        <translation>Flight</translation>
    </message>
    <message>
        <source>Route</source>
        <extracomment>How the route runs between waypoints: as a route of straight legs, not drawn as a curve</extracomment>
        <translation>Route</translation>
    </message>
    <message>
        <source>Course</source>
        <translation>Course</translation>
    </message>
    <message>
        <source>A recorded track keeps its course.</source>
        <translation>A recorded track keeps its course.</translation>
    </message>
    <message>
        <source>Colour</source>
        <translation>Colour</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Width</translation>
    </message>
    <message>
        <source>%1 px</source>
        <extracomment>A width in pixels on the screen</extracomment>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>Opacity</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Shadow under the route</source>
        <translation>Shadow under the route</translation>
    </message>
    <message>
        <source>Shadow distance</source>
        <translation>Shadow distance</translation>
    </message>
    <message>
        <source>Shadow width</source>
        <translation>Shadow width</translation>
    </message>
    <message>
        <source>Shadow opacity</source>
        <translation>Shadow opacity</translation>
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
        <translation>Waypoint</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Close</translation>
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
        <translation>Stop the preview</translation>
    </message>
    <message>
        <source>Play the preview</source>
        <translation>Play the preview</translation>
    </message>
    <message>
        <source>Position in the film</source>
        <translation>Position in the film</translation>
    </message>
    <message>
        <source>Settings of the film</source>
        <translation>Settings of the film</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Full screen</translation>
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
        <translation>Click a waypoint on the map to change it.</translation>
    </message>
    <message>
        <source>No waypoints yet. Click on the map to set one, or search for a place.</source>
        <translation>No waypoints yet. Click on the map to set one, or search for a place.</translation>
    </message>
    <message>
        <source>This waypoint</source>
        <translation>This waypoint</translation>
    </message>
    <message>
        <source>All waypoints</source>
        <translation>All waypoints</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>Title</translation>
    </message>
    <message>
        <source>Symbol</source>
        <translation>Symbol</translation>
    </message>
    <message>
        <source>Size</source>
        <translation>Size</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>A size in percent of the normal size</extracomment>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Timing</source>
        <translation>Timing</translation>
    </message>
    <message>
        <source>Stop at the waypoint</source>
        <translation>Stop at the waypoint</translation>
    </message>
    <message>
        <source>On the way to the next one</source>
        <translation>On the way to the next one</translation>
    </message>
    <message>
        <source>Caption</source>
        <translation>Caption</translation>
    </message>
    <message>
        <source>Font: %1, %2 pt…</source>
        <extracomment>Opens the choice of a font; %1 is the font&apos;s name, %2 its size in points</extracomment>
        <translation>Font: %1, %2 pt…</translation>
    </message>
    <message>
        <source>Font…</source>
        <translation>Font…</translation>
    </message>
    <message>
        <source>Frame behind the caption</source>
        <translation>Frame behind the caption</translation>
    </message>
    <message>
        <source>Shadow under the caption</source>
        <translation>Shadow under the caption</translation>
    </message>
    <message>
        <source>Show all waypoints</source>
        <translation>Show all waypoints</translation>
    </message>
    <message>
        <source>Show this waypoint</source>
        <translation>Show this waypoint</translation>
    </message>
    <message>
        <source>Delete waypoint</source>
        <translation>Delete waypoint</translation>
    </message>
</context>
</TS>
