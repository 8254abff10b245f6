<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>AvatarGrid</name>
    <message>
        <source>Delete this avatar</source>
        <translation>Eliminar este avatar</translation>
    </message>
</context>
<context>
    <name>AvatarSettingsPage</name>
    <message>
        <source>Size</source>
        <translation>Tamaño</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Turn with the road</source>
        <translation>Girar con la carretera</translation>
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
        <translation>Algo ha salido mal</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>FilmSettingsPage</name>
    <message>
        <source>Length, of the longest film</source>
        <translation>Duración, de la película más larga</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Longest film</source>
        <translation>Película más larga</translation>
    </message>
    <message>
        <source>Even pace over the whole route</source>
        <translation>Ritmo uniforme en toda la ruta</translation>
    </message>
    <message>
        <source>Waypoints</source>
        <translation>Etapas</translation>
    </message>
    <message>
        <source>Appear when reached</source>
        <translation>Aparecen al llegar</translation>
    </message>
    <message>
        <source>Pop up</source>
        <translation>Aparición animada</translation>
    </message>
    <message>
        <source>Pop-up time</source>
        <translation>Duración de la aparición</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>No stops at waypoints</source>
        <translation>Sin paradas en las etapas</translation>
    </message>
    <message>
        <source>Camera</source>
        <translation>Cámara</translation>
    </message>
    <message>
        <source>Still</source>
        <extracomment>The camera stays where the user left the map</extracomment>
        <translation>Fija</translation>
    </message>
    <message>
        <source>Follow</source>
        <extracomment>The camera keeps the avatar in the middle</extracomment>
        <translation>Seguir</translation>
    </message>
    <message>
        <source>Circle</source>
        <extracomment>The camera follows, the map seen through a round frame</extracomment>
        <translation>Círculo</translation>
    </message>
    <message>
        <source>Frame</source>
        <extracomment>The camera follows, the map seen through a frame of a chosen shape</extracomment>
        <translation>Marco</translation>
    </message>
    <message>
        <source>Fly in at the start</source>
        <translation>Llegada en vuelo al inicio</translation>
    </message>
    <message>
        <source>Fly-in</source>
        <translation>Llegada en vuelo</translation>
    </message>
    <message>
        <source>Turn on the way</source>
        <translation>Girar por el camino</translation>
    </message>
    <message>
        <source>Turn by</source>
        <translation>Girar</translation>
    </message>
    <message>
        <source>%1°</source>
        <translation>%1°</translation>
    </message>
    <message>
        <source>Tilt on the way</source>
        <translation>Inclinar por el camino</translation>
    </message>
    <message>
        <source>Tilt to</source>
        <translation>Inclinar hasta</translation>
    </message>
</context>
<context>
    <name>FilmSettingsPanel</name>
    <message>
        <source>Film</source>
        <translation>Película</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
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
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>HostStrings</name>
    <message>
        <source>All animations</source>
        <translation>Todas las animaciones</translation>
    </message>
    <message>
        <source>All archives</source>
        <translation>Todos los archivos comprimidos</translation>
    </message>
    <message>
        <source>All pictures</source>
        <translation>Todas las imágenes</translation>
    </message>
    <message>
        <source>All supported files</source>
        <translation>Todos los archivos compatibles</translation>
    </message>
    <message>
        <source>Choose a map or picture of your own</source>
        <translation>Elegir un mapa o una imagen propios</translation>
    </message>
    <message>
        <source>Save the film as</source>
        <translation>Guardar la película como</translation>
    </message>
    <message>
        <source>Deutsch</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <extracomment>Title of a new waypoint, followed by its number</extracomment>
        <translation>Etapa</translation>
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
        <translation>No se ha podido guardar la ruta como archivo GPX.</translation>
    </message>
    <message>
        <source>This file could not be opened. It is neither a project nor a track that Tourlet can read.</source>
        <translation>No se ha podido abrir este archivo. No es ni un proyecto ni un recorrido que Tourlet pueda leer.</translation>
    </message>
    <message>
        <source>There is not enough memory to finish this.</source>
        <translation>No hay memoria suficiente para terminar esta operación.</translation>
    </message>
    <message>
        <source>The file could not be opened.</source>
        <translation>No se ha podido abrir el archivo.</translation>
    </message>
    <message>
        <source>The file is damaged or built in a way that Tourlet does not know.</source>
        <translation>El archivo está dañado o tiene una estructura que Tourlet no conoce.</translation>
    </message>
    <message>
        <source>The video components that the export needs are missing on this computer.</source>
        <translation>En este ordenador faltan los componentes de vídeo que necesita la exportación.</translation>
    </message>
    <message>
        <source>The film could not be exported.</source>
        <translation>No se ha podido exportar la película.</translation>
    </message>
    <message>
        <source>MP4 video (H.264)</source>
        <translation>Vídeo MP4 (H.264)</translation>
    </message>
    <message>
        <source>WMV video</source>
        <translation>Vídeo WMV</translation>
    </message>
    <message>
        <source>4K (3840 × 2160)</source>
        <translation>4K (3840 × 2160)</translation>
    </message>
    <message>
        <source>Size of the window</source>
        <translation>Tamaño de la ventana</translation>
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
        <translation>Fecha del archivo</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>Nombre del archivo</translation>
    </message>
    <message>
        <source>Automatic</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Automático</translation>
    </message>
    <message>
        <source>Standard</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Estándar</translation>
    </message>
    <message>
        <source>Strong</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Fuerte</translation>
    </message>
    <message>
        <source>Off</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Desactivado</translation>
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
        <translation>Abrir tema del perfil de altitud</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Abrir</translation>
    </message>
    <message>
        <source>Loading</source>
        <extracomment>Shown while a file loads, followed by the share done in percent</extracomment>
        <translation>Cargando</translation>
    </message>
    <message>
        <source>10 minutes</source>
        <translation>10 minutos</translation>
    </message>
    <message>
        <source>1 minute</source>
        <translation>1 minuto</translation>
    </message>
    <message>
        <source>30 minutes</source>
        <translation>30 minutos</translation>
    </message>
    <message>
        <source>5 minutes</source>
        <translation>5 minutos</translation>
    </message>
    <message>
        <source>60 minutes</source>
        <translation>60 minutos</translation>
    </message>
    <message>
        <source>Date taken</source>
        <extracomment>Sort photos by the date stored in the photo by the camera</extracomment>
        <translation>Fecha de captura</translation>
    </message>
    <message>
        <source>Nederlands</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Nederlands</translation>
    </message>
    <message>
        <source>Tourlet projects</source>
        <translation>Proyectos de Tourlet</translation>
    </message>
    <message>
        <source>This project has changes that are not saved yet. Save them before Tourlet closes?</source>
        <translation>Este proyecto tiene cambios que aún no se han guardado. ¿Guardarlos antes de cerrar Tourlet?</translation>
    </message>
    <message>
        <source>Save altitude theme</source>
        <translation>Guardar tema del perfil de altitud</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Choose photos</source>
        <translation>Elegir fotos</translation>
    </message>
    <message>
        <source>Cut</source>
        <extracomment>Change between photos: straight cut</extracomment>
        <translation>Corte</translation>
    </message>
    <message>
        <source>Fade</source>
        <extracomment>Change between photos: cross-fade</extracomment>
        <translation>Fundido</translation>
    </message>
    <message>
        <source>Turn</source>
        <extracomment>Change between photos: the next photo turns in</extracomment>
        <translation>Giro</translation>
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
        <translation>Este proyecto tiene cambios que aún no se han guardado. ¿Guardarlos primero?</translation>
    </message>
    <message>
        <source>Delete this avatar?</source>
        <translation>¿Eliminar este avatar?</translation>
    </message>
</context>
<context>
    <name>MessageBox</name>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Don&apos;t save</source>
        <translation>No guardar</translation>
    </message>
    <message>
        <source>Send the film</source>
        <translation>Enviar la película</translation>
    </message>
    <message>
        <source>Show the tutorial</source>
        <translation>Mostrar el tutorial</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Open the system settings</source>
        <translation>Abrir la configuración del sistema</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>PlaceSearch</name>
    <message>
        <source>Searching…</source>
        <translation>Buscando…</translation>
    </message>
    <message>
        <source>Place search needs an internet connection.</source>
        <translation>La búsqueda de lugares necesita una conexión a Internet.</translation>
    </message>
    <message>
        <source>No place found for “%1”.</source>
        <translation>No se encontró ningún lugar para «%1».</translation>
    </message>
    <message>
        <source>The place search did not work. Try again later.</source>
        <translation>La búsqueda de lugares no ha funcionado. Vuelva a intentarlo más tarde.</translation>
    </message>
    <message>
        <source>Search a place</source>
        <translation>Buscar un lugar</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Borrar la búsqueda</translation>
    </message>
</context>
<context>
    <name>ProgressView</name>
    <message>
        <source>Exporting the film</source>
        <translation>Exportando la película</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>Share of the film exported so far</extracomment>
        <translation>%1&#xa0;%</translation>
    </message>
    <message>
        <source>Hide window</source>
        <translation>Ocultar ventana</translation>
    </message>
    <message>
        <source>Stop export</source>
        <translation>Detener la exportación</translation>
    </message>
</context>
<context>
    <name>ProjectToolBar</name>
    <message>
        <source>New project</source>
        <translation>Proyecto nuevo</translation>
    </message>
    <message>
        <source>Open project</source>
        <translation>Abrir proyecto</translation>
    </message>
    <message>
        <source>Open track</source>
        <translation>Abrir recorrido</translation>
    </message>
    <message>
        <source>Save project</source>
        <translation>Guardar proyecto</translation>
    </message>
    <message>
        <source>Export route as GPX</source>
        <translation>Exportar ruta como GPX</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Idioma</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Pantalla completa</translation>
    </message>
    <message>
        <source>Route and waypoints</source>
        <translation>Ruta y etapas</translation>
    </message>
</context>
<context>
    <name>RouteSettingsPage</name>
    <message>
        <source>Straight</source>
        <extracomment>How the route runs between waypoints: straight lines</extracomment>
        <translation>Recto</translation>
    </message>
    <message>
        <source>Curved</source>
        <extracomment>How the route runs between waypoints: a smooth curve</extracomment>
        <translation>Curvo</translation>
    </message>
    <message>
        <source>Flight</source>
        <extracomment>How the route runs between waypoints: arcs like a flight</extracomment>
        <translation>Vuelo</translation>
    </message>
    <message>
        <source>Route</source>
        <extracomment>How the route runs between waypoints: as a route of straight legs, not drawn as a curve</extracomment>
        <translation>Trayecto</translation>
    </message>
    <message>
        <source>Course</source>
        <translation>Trazado</translation>
    </message>
    <message>
        <source>A recorded track keeps its course.</source>
        <translation>Un track grabado conserva su trazado.</translation>
    </message>
    <message>
        <source>Colour</source>
        <translation>Color</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Grosor</translation>
    </message>
    <message>
        <source>%1 px</source>
        <extracomment>A width in pixels on the screen</extracomment>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>Opacidad</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Shadow under the route</source>
        <translation>Sombra bajo la ruta</translation>
    </message>
    <message>
        <source>Shadow distance</source>
        <translation>Distancia de la sombra</translation>
    </message>
    <message>
        <source>Shadow width</source>
        <translation>Grosor de la sombra</translation>
    </message>
    <message>
        <source>Shadow opacity</source>
        <translation>Opacidad de la sombra</translation>
    </message>
</context>
<context>
    <name>SettingsPanel</name>
    <message>
        <source>Route</source>
        <translation>Ruta</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <translation>Etapa</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Cerrar</translation>
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
        <translation>Detener la vista previa</translation>
    </message>
    <message>
        <source>Play the preview</source>
        <translation>Reproducir la vista previa</translation>
    </message>
    <message>
        <source>Position in the film</source>
        <translation>Posición en la película</translation>
    </message>
    <message>
        <source>Settings of the film</source>
        <translation>Ajustes de la película</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Pantalla completa</translation>
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
        <translation>Haga clic en una etapa del mapa para cambiarla.</translation>
    </message>
    <message>
        <source>No waypoints yet. Click on the map to set one, or search for a place.</source>
        <translation>Todavía no hay etapas. Haga clic en el mapa para añadir una o busque un lugar.</translation>
    </message>
    <message>
        <source>This waypoint</source>
        <translation>Esta etapa</translation>
    </message>
    <message>
        <source>All waypoints</source>
        <translation>Todas las etapas</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>Título</translation>
    </message>
    <message>
        <source>Symbol</source>
        <translation>Símbolo</translation>
    </message>
    <message>
        <source>Size</source>
        <translation>Tamaño</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>A size in percent of the normal size</extracomment>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Timing</source>
        <translation>Tiempos</translation>
    </message>
    <message>
        <source>Stop at the waypoint</source>
        <translation>Parada en la etapa</translation>
    </message>
    <message>
        <source>On the way to the next one</source>
        <translation>Trayecto hasta la siguiente</translation>
    </message>
    <message>
        <source>Caption</source>
        <translation>Rótulo</translation>
    </message>
    <message>
        <source>Font: %1, %2 pt…</source>
        <extracomment>Opens the choice of a font; %1 is the font&apos;s name, %2 its size in points</extracomment>
        <translation>Fuente: %1, %2 pt…</translation>
    </message>
    <message>
        <source>Font…</source>
        <translation>Fuente…</translation>
    </message>
    <message>
        <source>Frame behind the caption</source>
        <translation>Marco detrás del rótulo</translation>
    </message>
    <message>
        <source>Shadow under the caption</source>
        <translation>Sombra bajo el rótulo</translation>
    </message>
    <message>
        <source>Show all waypoints</source>
        <translation>Mostrar todas las etapas</translation>
    </message>
    <message>
        <source>Show this waypoint</source>
        <translation>Mostrar esta etapa</translation>
    </message>
    <message>
        <source>Delete waypoint</source>
        <translation>Eliminar la etapa</translation>
    </message>
</context>
</TS>
