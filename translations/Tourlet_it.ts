<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it_IT">
<context>
    <name>AvatarGrid</name>
    <message>
        <source>Delete this avatar</source>
        <translation>Elimina questo avatar</translation>
    </message>
</context>
<context>
    <name>AvatarSettingsPage</name>
    <message>
        <source>Size</source>
        <translation>Dimensione</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Turn with the road</source>
        <translation>Ruota con la strada</translation>
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
        <translation>Si è verificato un problema</translation>
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
        <translation>Durata, del film più lungo</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Longest film</source>
        <translation>Film più lungo</translation>
    </message>
    <message>
        <source>Even pace over the whole route</source>
        <translation>Andatura costante su tutto il percorso</translation>
    </message>
    <message>
        <source>Waypoints</source>
        <translation>Tappe</translation>
    </message>
    <message>
        <source>Appear when reached</source>
        <translation>Appaiono quando raggiunte</translation>
    </message>
    <message>
        <source>Pop up</source>
        <translation>Comparsa animata</translation>
    </message>
    <message>
        <source>Pop-up time</source>
        <translation>Durata della comparsa</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>No stops at waypoints</source>
        <translation>Nessuna sosta alle tappe</translation>
    </message>
    <message>
        <source>Camera</source>
        <translation>Telecamera</translation>
    </message>
    <message>
        <source>Still</source>
        <extracomment>The camera stays where the user left the map</extracomment>
        <translation>Fissa</translation>
    </message>
    <message>
        <source>Follow</source>
        <extracomment>The camera keeps the avatar in the middle</extracomment>
        <translation>Segui</translation>
    </message>
    <message>
        <source>Circle</source>
        <extracomment>The camera follows, the map seen through a round frame</extracomment>
        <translation>Cerchio</translation>
    </message>
    <message>
        <source>Frame</source>
        <extracomment>The camera follows, the map seen through a frame of a chosen shape</extracomment>
        <translation>Cornice</translation>
    </message>
    <message>
        <source>Fly in at the start</source>
        <translation>Arrivo in volo all’inizio</translation>
    </message>
    <message>
        <source>Fly-in</source>
        <translation>Arrivo in volo</translation>
    </message>
    <message>
        <source>Turn on the way</source>
        <translation>Ruota durante il volo</translation>
    </message>
    <message>
        <source>Turn by</source>
        <translation>Ruota di</translation>
    </message>
    <message>
        <source>%1°</source>
        <translation>%1°</translation>
    </message>
    <message>
        <source>Tilt on the way</source>
        <translation>Inclina durante il volo</translation>
    </message>
    <message>
        <source>Tilt to</source>
        <translation>Inclina fino a</translation>
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
        <translation>Chiudi</translation>
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
        <translation>%1 O</translation>
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
        <translation>Tutte le animazioni</translation>
    </message>
    <message>
        <source>All archives</source>
        <translation>Tutti gli archivi</translation>
    </message>
    <message>
        <source>All pictures</source>
        <translation>Tutte le immagini</translation>
    </message>
    <message>
        <source>All supported files</source>
        <translation>Tutti i file supportati</translation>
    </message>
    <message>
        <source>Choose a map or picture of your own</source>
        <translation>Scegli una mappa o un’immagine personale</translation>
    </message>
    <message>
        <source>Save the film as</source>
        <translation>Salva il filmato come</translation>
    </message>
    <message>
        <source>Deutsch</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <extracomment>Title of a new waypoint, followed by its number</extracomment>
        <translation>Tappa</translation>
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
        <translation>Non è stato possibile salvare il percorso come file GPX.</translation>
    </message>
    <message>
        <source>This file could not be opened. It is neither a project nor a track that Tourlet can read.</source>
        <translation>Non è stato possibile aprire questo file. Non è né un progetto né una traccia che Tourlet sappia leggere.</translation>
    </message>
    <message>
        <source>There is not enough memory to finish this.</source>
        <translation>La memoria non è sufficiente per completare l’operazione.</translation>
    </message>
    <message>
        <source>The file could not be opened.</source>
        <translation>Non è stato possibile aprire il file.</translation>
    </message>
    <message>
        <source>The file is damaged or built in a way that Tourlet does not know.</source>
        <translation>Il file è danneggiato o ha una struttura che Tourlet non conosce.</translation>
    </message>
    <message>
        <source>The video components that the export needs are missing on this computer.</source>
        <translation>Su questo computer mancano i componenti video necessari per l’esportazione.</translation>
    </message>
    <message>
        <source>The film could not be exported.</source>
        <translation>Non è stato possibile esportare il filmato.</translation>
    </message>
    <message>
        <source>MP4 video (H.264)</source>
        <translation>Video MP4 (H.264)</translation>
    </message>
    <message>
        <source>WMV video</source>
        <translation>Video WMV</translation>
    </message>
    <message>
        <source>4K (3840 × 2160)</source>
        <translation>4K (3840 × 2160)</translation>
    </message>
    <message>
        <source>Size of the window</source>
        <translation>Dimensioni della finestra</translation>
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
        <translation>Data del file</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>Nome del file</translation>
    </message>
    <message>
        <source>Automatic</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Automatico</translation>
    </message>
    <message>
        <source>Standard</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Standard</translation>
    </message>
    <message>
        <source>Strong</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Forte</translation>
    </message>
    <message>
        <source>Off</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Disattivato</translation>
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
        <translation>Apri tema del profilo altimetrico</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Apri</translation>
    </message>
    <message>
        <source>Loading</source>
        <extracomment>Shown while a file loads, followed by the share done in percent</extracomment>
        <translation>Caricamento</translation>
    </message>
    <message>
        <source>10 minutes</source>
        <translation>10 minuti</translation>
    </message>
    <message>
        <source>1 minute</source>
        <translation>1 minuto</translation>
    </message>
    <message>
        <source>30 minutes</source>
        <translation>30 minuti</translation>
    </message>
    <message>
        <source>5 minutes</source>
        <translation>5 minuti</translation>
    </message>
    <message>
        <source>60 minutes</source>
        <translation>60 minuti</translation>
    </message>
    <message>
        <source>Date taken</source>
        <extracomment>Sort photos by the date stored in the photo by the camera</extracomment>
        <translation>Data di scatto</translation>
    </message>
    <message>
        <source>Nederlands</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Nederlands</translation>
    </message>
    <message>
        <source>Tourlet projects</source>
        <translation>Progetti Tourlet</translation>
    </message>
    <message>
        <source>This project has changes that are not saved yet. Save them before Tourlet closes?</source>
        <translation>Questo progetto contiene modifiche non ancora salvate. Salvarle prima di chiudere Tourlet?</translation>
    </message>
    <message>
        <source>Save altitude theme</source>
        <translation>Salva tema del profilo altimetrico</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
    <message>
        <source>Choose photos</source>
        <translation>Scegli le foto</translation>
    </message>
    <message>
        <source>Cut</source>
        <extracomment>Change between photos: straight cut</extracomment>
        <translation>Taglio</translation>
    </message>
    <message>
        <source>Fade</source>
        <extracomment>Change between photos: cross-fade</extracomment>
        <translation>Dissolvenza</translation>
    </message>
    <message>
        <source>Turn</source>
        <extracomment>Change between photos: the next photo turns in</extracomment>
        <translation>Rotazione</translation>
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
        <translation>Questo progetto contiene modifiche non ancora salvate. Salvarle prima?</translation>
    </message>
    <message>
        <source>Delete this avatar?</source>
        <translation>Eliminare questo avatar?</translation>
    </message>
</context>
<context>
    <name>MessageBox</name>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annulla</translation>
    </message>
    <message>
        <source>Don&apos;t save</source>
        <translation>Non salvare</translation>
    </message>
    <message>
        <source>Send the film</source>
        <translation>Invia il filmato</translation>
    </message>
    <message>
        <source>Show the tutorial</source>
        <translation>Mostra il tutorial</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Elimina</translation>
    </message>
    <message>
        <source>Open the system settings</source>
        <translation>Apri le impostazioni di sistema</translation>
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
        <translation>Ricerca in corso…</translation>
    </message>
    <message>
        <source>Place search needs an internet connection.</source>
        <translation>La ricerca di luoghi richiede una connessione a Internet.</translation>
    </message>
    <message>
        <source>No place found for “%1”.</source>
        <translation>Nessun luogo trovato per «%1».</translation>
    </message>
    <message>
        <source>The place search did not work. Try again later.</source>
        <translation>La ricerca di luoghi non ha funzionato. Riprova più tardi.</translation>
    </message>
    <message>
        <source>Search a place</source>
        <translation>Cerca un luogo</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Cancella la ricerca</translation>
    </message>
</context>
<context>
    <name>ProgressView</name>
    <message>
        <source>Exporting the film</source>
        <translation>Esportazione del filmato</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>Share of the film exported so far</extracomment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Hide window</source>
        <translation>Nascondi finestra</translation>
    </message>
    <message>
        <source>Stop export</source>
        <translation>Interrompi esportazione</translation>
    </message>
</context>
<context>
    <name>ProjectToolBar</name>
    <message>
        <source>New project</source>
        <translation>Nuovo progetto</translation>
    </message>
    <message>
        <source>Open project</source>
        <translation>Apri progetto</translation>
    </message>
    <message>
        <source>Open track</source>
        <translation>Apri traccia</translation>
    </message>
    <message>
        <source>Save project</source>
        <translation>Salva progetto</translation>
    </message>
    <message>
        <source>Export route as GPX</source>
        <translation>Esporta percorso in GPX</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Lingua</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Schermo intero</translation>
    </message>
    <message>
        <source>Route and waypoints</source>
        <translation>Percorso e tappe</translation>
    </message>
</context>
<context>
    <name>RouteSettingsPage</name>
    <message>
        <source>Straight</source>
        <extracomment>How the route runs between waypoints: straight lines</extracomment>
        <translation>Dritto</translation>
    </message>
    <message>
        <source>Curved</source>
        <extracomment>How the route runs between waypoints: a smooth curve</extracomment>
        <translation>Curvo</translation>
    </message>
    <message>
        <source>Flight</source>
        <extracomment>How the route runs between waypoints: arcs like a flight</extracomment>
        <translation>Volo</translation>
    </message>
    <message>
        <source>Route</source>
        <extracomment>How the route runs between waypoints: as a route of straight legs, not drawn as a curve</extracomment>
        <translation>Tragitto</translation>
    </message>
    <message>
        <source>Course</source>
        <translation>Andamento</translation>
    </message>
    <message>
        <source>A recorded track keeps its course.</source>
        <translation>Una traccia registrata mantiene il suo andamento.</translation>
    </message>
    <message>
        <source>Colour</source>
        <translation>Colore</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Spessore</translation>
    </message>
    <message>
        <source>%1 px</source>
        <extracomment>A width in pixels on the screen</extracomment>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>Opacità</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Shadow under the route</source>
        <translation>Ombra sotto il percorso</translation>
    </message>
    <message>
        <source>Shadow distance</source>
        <translation>Distanza dell’ombra</translation>
    </message>
    <message>
        <source>Shadow width</source>
        <translation>Spessore dell’ombra</translation>
    </message>
    <message>
        <source>Shadow opacity</source>
        <translation>Opacità dell’ombra</translation>
    </message>
</context>
<context>
    <name>SettingsPanel</name>
    <message>
        <source>Route</source>
        <translation>Percorso</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <translation>Tappa</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Chiudi</translation>
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
        <translation>Ferma l’anteprima</translation>
    </message>
    <message>
        <source>Play the preview</source>
        <translation>Riproduci l’anteprima</translation>
    </message>
    <message>
        <source>Position in the film</source>
        <translation>Posizione nel film</translation>
    </message>
    <message>
        <source>Settings of the film</source>
        <translation>Impostazioni del film</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Schermo intero</translation>
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
        <translation>Fai clic su una tappa sulla mappa per modificarla.</translation>
    </message>
    <message>
        <source>No waypoints yet. Click on the map to set one, or search for a place.</source>
        <translation>Ancora nessuna tappa. Fai clic sulla mappa per aggiungerne una, oppure cerca un luogo.</translation>
    </message>
    <message>
        <source>This waypoint</source>
        <translation>Questa tappa</translation>
    </message>
    <message>
        <source>All waypoints</source>
        <translation>Tutte le tappe</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>Titolo</translation>
    </message>
    <message>
        <source>Symbol</source>
        <translation>Simbolo</translation>
    </message>
    <message>
        <source>Size</source>
        <translation>Dimensione</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>A size in percent of the normal size</extracomment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Timing</source>
        <translation>Tempi</translation>
    </message>
    <message>
        <source>Stop at the waypoint</source>
        <translation>Sosta alla tappa</translation>
    </message>
    <message>
        <source>On the way to the next one</source>
        <translation>Tragitto fino alla successiva</translation>
    </message>
    <message>
        <source>Caption</source>
        <translation>Didascalia</translation>
    </message>
    <message>
        <source>Font: %1, %2 pt…</source>
        <extracomment>Opens the choice of a font; %1 is the font&apos;s name, %2 its size in points</extracomment>
        <translation>Carattere: %1, %2 pt…</translation>
    </message>
    <message>
        <source>Font…</source>
        <translation>Carattere…</translation>
    </message>
    <message>
        <source>Frame behind the caption</source>
        <translation>Riquadro dietro la didascalia</translation>
    </message>
    <message>
        <source>Shadow under the caption</source>
        <translation>Ombra sotto la didascalia</translation>
    </message>
    <message>
        <source>Show all waypoints</source>
        <translation>Mostra tutte le tappe</translation>
    </message>
    <message>
        <source>Show this waypoint</source>
        <translation>Mostra questa tappa</translation>
    </message>
    <message>
        <source>Delete waypoint</source>
        <translation>Elimina la tappa</translation>
    </message>
</context>
</TS>
