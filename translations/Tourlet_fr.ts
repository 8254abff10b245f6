<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
<context>
    <name>AvatarGrid</name>
    <message>
        <source>Delete this avatar</source>
        <translation>Supprimer cet avatar</translation>
    </message>
</context>
<context>
    <name>AvatarSettingsPage</name>
    <message>
        <source>Size</source>
        <translation>Taille</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Turn with the road</source>
        <translation>Tourner avec la route</translation>
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
        <translation>Une erreur est survenue</translation>
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
        <translation>Durée, du film le plus long</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Longest film</source>
        <translation>Film le plus long</translation>
    </message>
    <message>
        <source>Even pace over the whole route</source>
        <translation>Allure régulière sur tout le parcours</translation>
    </message>
    <message>
        <source>Waypoints</source>
        <translation>Étapes</translation>
    </message>
    <message>
        <source>Appear when reached</source>
        <translation>Apparaissent une fois atteintes</translation>
    </message>
    <message>
        <source>Pop up</source>
        <translation>Apparition animée</translation>
    </message>
    <message>
        <source>Pop-up time</source>
        <translation>Durée de l&apos;apparition</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1 s</translation>
    </message>
    <message>
        <source>No stops at waypoints</source>
        <translation>Pas d’arrêt aux étapes</translation>
    </message>
    <message>
        <source>Camera</source>
        <translation>Caméra</translation>
    </message>
    <message>
        <source>Still</source>
        <extracomment>The camera stays where the user left the map</extracomment>
        <translation>Fixe</translation>
    </message>
    <message>
        <source>Follow</source>
        <extracomment>The camera keeps the avatar in the middle</extracomment>
        <translation>Suivre</translation>
    </message>
    <message>
        <source>Circle</source>
        <extracomment>The camera follows, the map seen through a round frame</extracomment>
        <translation>Cercle</translation>
    </message>
    <message>
        <source>Frame</source>
        <extracomment>The camera follows, the map seen through a frame of a chosen shape</extracomment>
        <translation>Cadre</translation>
    </message>
    <message>
        <source>Fly in at the start</source>
        <translation>Arrivée en vol au début</translation>
    </message>
    <message>
        <source>Fly-in</source>
        <translation>Arrivée en vol</translation>
    </message>
    <message>
        <source>Turn on the way</source>
        <translation>Tourner en chemin</translation>
    </message>
    <message>
        <source>Turn by</source>
        <translation>Tourner de</translation>
    </message>
    <message>
        <source>%1°</source>
        <translation>%1°</translation>
    </message>
    <message>
        <source>Tilt on the way</source>
        <translation>Incliner en chemin</translation>
    </message>
    <message>
        <source>Tilt to</source>
        <translation>Incliner à</translation>
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
        <translation>Fermer</translation>
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
        <translation>Toutes les animations</translation>
    </message>
    <message>
        <source>All archives</source>
        <translation>Toutes les archives</translation>
    </message>
    <message>
        <source>All pictures</source>
        <translation>Toutes les images</translation>
    </message>
    <message>
        <source>All supported files</source>
        <translation>Tous les fichiers pris en charge</translation>
    </message>
    <message>
        <source>Choose a map or picture of your own</source>
        <translation>Choisir votre propre carte ou image</translation>
    </message>
    <message>
        <source>Save the film as</source>
        <translation>Enregistrer le film sous</translation>
    </message>
    <message>
        <source>Deutsch</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <extracomment>Title of a new waypoint, followed by its number</extracomment>
        <translation>Étape</translation>
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
        <translation>L&apos;itinéraire n&apos;a pas pu être enregistré en fichier GPX.</translation>
    </message>
    <message>
        <source>This file could not be opened. It is neither a project nor a track that Tourlet can read.</source>
        <translation>Ce fichier n&apos;a pas pu être ouvert. Ce n&apos;est ni un projet ni une trace que Tourlet sait lire.</translation>
    </message>
    <message>
        <source>There is not enough memory to finish this.</source>
        <translation>La mémoire est insuffisante pour terminer cette opération.</translation>
    </message>
    <message>
        <source>The file could not be opened.</source>
        <translation>Le fichier n&apos;a pas pu être ouvert.</translation>
    </message>
    <message>
        <source>The file is damaged or built in a way that Tourlet does not know.</source>
        <translation>Le fichier est endommagé ou sa structure est inconnue de Tourlet.</translation>
    </message>
    <message>
        <source>The video components that the export needs are missing on this computer.</source>
        <translation>Les composants vidéo nécessaires à l&apos;exportation manquent sur cet ordinateur.</translation>
    </message>
    <message>
        <source>The film could not be exported.</source>
        <translation>Le film n&apos;a pas pu être exporté.</translation>
    </message>
    <message>
        <source>MP4 video (H.264)</source>
        <translation>Vidéo MP4 (H.264)</translation>
    </message>
    <message>
        <source>WMV video</source>
        <translation>Vidéo WMV</translation>
    </message>
    <message>
        <source>4K (3840 × 2160)</source>
        <translation>4K (3840 × 2160)</translation>
    </message>
    <message>
        <source>Size of the window</source>
        <translation>Taille de la fenêtre</translation>
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
        <translation>Date du fichier</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>Nom du fichier</translation>
    </message>
    <message>
        <source>Automatic</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Automatique</translation>
    </message>
    <message>
        <source>Standard</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Standard</translation>
    </message>
    <message>
        <source>Strong</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Fort</translation>
    </message>
    <message>
        <source>Off</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>Désactivé</translation>
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
        <translation>Ouvrir un thème de profil altimétrique</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Ouvrir</translation>
    </message>
    <message>
        <source>Loading</source>
        <extracomment>Shown while a file loads, followed by the share done in percent</extracomment>
        <translation>Chargement</translation>
    </message>
    <message>
        <source>10 minutes</source>
        <translation>10&#xa0;minutes</translation>
    </message>
    <message>
        <source>1 minute</source>
        <translation>1&#xa0;minute</translation>
    </message>
    <message>
        <source>30 minutes</source>
        <translation>30&#xa0;minutes</translation>
    </message>
    <message>
        <source>5 minutes</source>
        <translation>5&#xa0;minutes</translation>
    </message>
    <message>
        <source>60 minutes</source>
        <translation>60&#xa0;minutes</translation>
    </message>
    <message>
        <source>Date taken</source>
        <extracomment>Sort photos by the date stored in the photo by the camera</extracomment>
        <translation>Date de prise de vue</translation>
    </message>
    <message>
        <source>Nederlands</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Nederlands</translation>
    </message>
    <message>
        <source>Tourlet projects</source>
        <translation>Projets Tourlet</translation>
    </message>
    <message>
        <source>This project has changes that are not saved yet. Save them before Tourlet closes?</source>
        <translation>Ce projet contient des modifications non enregistrées. Les enregistrer avant de fermer Tourlet&#xa0;?</translation>
    </message>
    <message>
        <source>Save altitude theme</source>
        <translation>Enregistrer le thème de profil altimétrique</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Choose photos</source>
        <translation>Choisir des photos</translation>
    </message>
    <message>
        <source>Cut</source>
        <extracomment>Change between photos: straight cut</extracomment>
        <translation>Coupe</translation>
    </message>
    <message>
        <source>Fade</source>
        <extracomment>Change between photos: cross-fade</extracomment>
        <translation>Fondu</translation>
    </message>
    <message>
        <source>Turn</source>
        <extracomment>Change between photos: the next photo turns in</extracomment>
        <translation>Rotation</translation>
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
        <translation>Ce projet contient des modifications non enregistrées. Les enregistrer d&apos;abord&#xa0;?</translation>
    </message>
    <message>
        <source>Delete this avatar?</source>
        <translation>Supprimer cet avatar ?</translation>
    </message>
</context>
<context>
    <name>MessageBox</name>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
    <message>
        <source>Don&apos;t save</source>
        <translation>Ne pas enregistrer</translation>
    </message>
    <message>
        <source>Send the film</source>
        <translation>Envoyer le film</translation>
    </message>
    <message>
        <source>Show the tutorial</source>
        <translation>Afficher le tutoriel</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Open the system settings</source>
        <translation>Ouvrir les paramètres système</translation>
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
        <translation>Recherche en cours…</translation>
    </message>
    <message>
        <source>Place search needs an internet connection.</source>
        <translation>La recherche de lieux nécessite une connexion à Internet.</translation>
    </message>
    <message>
        <source>No place found for “%1”.</source>
        <translation>Aucun lieu trouvé pour «&#xa0;%1&#xa0;».</translation>
    </message>
    <message>
        <source>The place search did not work. Try again later.</source>
        <translation>La recherche de lieux n’a pas fonctionné. Réessayez plus tard.</translation>
    </message>
    <message>
        <source>Search a place</source>
        <translation>Rechercher un lieu</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Effacer la recherche</translation>
    </message>
</context>
<context>
    <name>ProgressView</name>
    <message>
        <source>Exporting the film</source>
        <translation>Exportation du film</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>Share of the film exported so far</extracomment>
        <translation>%1&#xa0;%</translation>
    </message>
    <message>
        <source>Hide window</source>
        <translation>Masquer la fenêtre</translation>
    </message>
    <message>
        <source>Stop export</source>
        <translation>Arrêter l&apos;exportation</translation>
    </message>
</context>
<context>
    <name>ProjectToolBar</name>
    <message>
        <source>New project</source>
        <translation>Nouveau projet</translation>
    </message>
    <message>
        <source>Open project</source>
        <translation>Ouvrir un projet</translation>
    </message>
    <message>
        <source>Open track</source>
        <translation>Ouvrir une trace</translation>
    </message>
    <message>
        <source>Save project</source>
        <translation>Enregistrer le projet</translation>
    </message>
    <message>
        <source>Export route as GPX</source>
        <translation>Exporter l&apos;itinéraire en GPX</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Langue</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Plein écran</translation>
    </message>
    <message>
        <source>Route and waypoints</source>
        <translation>Itinéraire et étapes</translation>
    </message>
</context>
<context>
    <name>RouteSettingsPage</name>
    <message>
        <source>Straight</source>
        <extracomment>How the route runs between waypoints: straight lines</extracomment>
        <translation>Droit</translation>
    </message>
    <message>
        <source>Curved</source>
        <extracomment>How the route runs between waypoints: a smooth curve</extracomment>
        <translation>Courbe</translation>
    </message>
    <message>
        <source>Flight</source>
        <extracomment>How the route runs between waypoints: arcs like a flight</extracomment>
        <translation>Vol</translation>
    </message>
    <message>
        <source>Route</source>
        <extracomment>How the route runs between waypoints: as a route of straight legs, not drawn as a curve</extracomment>
        <translation>Trajet</translation>
    </message>
    <message>
        <source>Course</source>
        <translation>Tracé</translation>
    </message>
    <message>
        <source>A recorded track keeps its course.</source>
        <translation>Une trace enregistrée garde son tracé.</translation>
    </message>
    <message>
        <source>Colour</source>
        <translation>Couleur</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>Épaisseur</translation>
    </message>
    <message>
        <source>%1 px</source>
        <extracomment>A width in pixels on the screen</extracomment>
        <translation>%1&#xa0;px</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>Opacité</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1&#xa0;%</translation>
    </message>
    <message>
        <source>Shadow under the route</source>
        <translation>Ombre sous l’itinéraire</translation>
    </message>
    <message>
        <source>Shadow distance</source>
        <translation>Distance de l’ombre</translation>
    </message>
    <message>
        <source>Shadow width</source>
        <translation>Épaisseur de l’ombre</translation>
    </message>
    <message>
        <source>Shadow opacity</source>
        <translation>Opacité de l’ombre</translation>
    </message>
</context>
<context>
    <name>SettingsPanel</name>
    <message>
        <source>Route</source>
        <translation>Itinéraire</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <translation>Étape</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Fermer</translation>
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
        <translation>Arrêter l&apos;aperçu</translation>
    </message>
    <message>
        <source>Play the preview</source>
        <translation>Lire l&apos;aperçu</translation>
    </message>
    <message>
        <source>Position in the film</source>
        <translation>Position dans le film</translation>
    </message>
    <message>
        <source>Settings of the film</source>
        <translation>Réglages du film</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>Plein écran</translation>
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
        <translation>Cliquez sur une étape de la carte pour la modifier.</translation>
    </message>
    <message>
        <source>No waypoints yet. Click on the map to set one, or search for a place.</source>
        <translation>Aucune étape pour l’instant. Cliquez sur la carte pour en placer une, ou recherchez un lieu.</translation>
    </message>
    <message>
        <source>This waypoint</source>
        <translation>Cette étape</translation>
    </message>
    <message>
        <source>All waypoints</source>
        <translation>Toutes les étapes</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>Titre</translation>
    </message>
    <message>
        <source>Symbol</source>
        <translation>Symbole</translation>
    </message>
    <message>
        <source>Size</source>
        <translation>Taille</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>A size in percent of the normal size</extracomment>
        <translation>%1&#xa0;%</translation>
    </message>
    <message>
        <source>Timing</source>
        <translation>Durées</translation>
    </message>
    <message>
        <source>Stop at the waypoint</source>
        <translation>Arrêt à l’étape</translation>
    </message>
    <message>
        <source>On the way to the next one</source>
        <translation>Trajet jusqu’à la suivante</translation>
    </message>
    <message>
        <source>Caption</source>
        <translation>Légende</translation>
    </message>
    <message>
        <source>Font: %1, %2 pt…</source>
        <extracomment>Opens the choice of a font; %1 is the font&apos;s name, %2 its size in points</extracomment>
        <translation>Police&#xa0;: %1, %2&#xa0;pt…</translation>
    </message>
    <message>
        <source>Font…</source>
        <translation>Police…</translation>
    </message>
    <message>
        <source>Frame behind the caption</source>
        <translation>Cadre derrière la légende</translation>
    </message>
    <message>
        <source>Shadow under the caption</source>
        <translation>Ombre sous la légende</translation>
    </message>
    <message>
        <source>Show all waypoints</source>
        <translation>Afficher toutes les étapes</translation>
    </message>
    <message>
        <source>Show this waypoint</source>
        <translation>Afficher cette étape</translation>
    </message>
    <message>
        <source>Delete waypoint</source>
        <translation>Supprimer l’étape</translation>
    </message>
</context>
</TS>
