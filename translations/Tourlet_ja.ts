<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja_JP">
<context>
    <name>AvatarGrid</name>
    <message>
        <source>Delete this avatar</source>
        <translation>このアバターを削除</translation>
    </message>
</context>
<context>
    <name>AvatarSettingsPage</name>
    <message>
        <source>Size</source>
        <translation>サイズ</translation>
    </message>
    <message>
        <source>%1 px</source>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Turn with the road</source>
        <translation>道に沿って向きを変える</translation>
    </message>
</context>
<context>
    <name>DurationField</name>
    <message>
        <source>s</source>
        <extracomment>Unit after a duration field: seconds</extracomment>
        <translation>秒</translation>
    </message>
</context>
<context>
    <name>ErrorBox</name>
    <message>
        <source>Something went wrong</source>
        <translation>問題が発生しました</translation>
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
        <translation>長さ（最長の映像に対して）</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Longest film</source>
        <translation>最長の映像</translation>
    </message>
    <message>
        <source>Even pace over the whole route</source>
        <translation>ルート全体を一定の速さで</translation>
    </message>
    <message>
        <source>Waypoints</source>
        <translation>ウェイポイント</translation>
    </message>
    <message>
        <source>Appear when reached</source>
        <translation>到着したら表示</translation>
    </message>
    <message>
        <source>Pop up</source>
        <translation>ポップアップ表示</translation>
    </message>
    <message>
        <source>Pop-up time</source>
        <translation>ポップアップの時間</translation>
    </message>
    <message>
        <source>%1 s</source>
        <translation>%1秒</translation>
    </message>
    <message>
        <source>No stops at waypoints</source>
        <translation>ウェイポイントで停止しない</translation>
    </message>
    <message>
        <source>Camera</source>
        <translation>カメラ</translation>
    </message>
    <message>
        <source>Still</source>
        <extracomment>The camera stays where the user left the map</extracomment>
        <translation>固定</translation>
    </message>
    <message>
        <source>Follow</source>
        <extracomment>The camera keeps the avatar in the middle</extracomment>
        <translation>追従</translation>
    </message>
    <message>
        <source>Circle</source>
        <extracomment>The camera follows, the map seen through a round frame</extracomment>
        <translation>円</translation>
    </message>
    <message>
        <source>Frame</source>
        <extracomment>The camera follows, the map seen through a frame of a chosen shape</extracomment>
        <translation>フレーム</translation>
    </message>
    <message>
        <source>Fly in at the start</source>
        <translation>最初に上空から近づく</translation>
    </message>
    <message>
        <source>Fly-in</source>
        <translation>接近</translation>
    </message>
    <message>
        <source>Turn on the way</source>
        <translation>途中で回転</translation>
    </message>
    <message>
        <source>Turn by</source>
        <translation>回転角</translation>
    </message>
    <message>
        <source>%1°</source>
        <translation>%1°</translation>
    </message>
    <message>
        <source>Tilt on the way</source>
        <translation>途中で傾ける</translation>
    </message>
    <message>
        <source>Tilt to</source>
        <translation>傾き</translation>
    </message>
</context>
<context>
    <name>FilmSettingsPanel</name>
    <message>
        <source>Film</source>
        <translation>映像</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
</context>
<context>
    <name>Graticule</name>
    <message>
        <source>%1 N</source>
        <extracomment>Latitude north of the equator; %1 is the angle, such as 51°12′</extracomment>
        <translation>北緯 %1</translation>
    </message>
    <message>
        <source>%1 S</source>
        <extracomment>Latitude south of the equator; %1 is the angle, such as 51°12′</extracomment>
        <translation>南緯 %1</translation>
    </message>
    <message>
        <source>%1 E</source>
        <extracomment>Longitude east of Greenwich; %1 is the angle, such as 13°30′</extracomment>
        <translation>東経 %1</translation>
    </message>
    <message>
        <source>%1 W</source>
        <extracomment>Longitude west of Greenwich; %1 is the angle, such as 13°30′</extracomment>
        <translation>西経 %1</translation>
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
        <translation>すべてのアニメーション</translation>
    </message>
    <message>
        <source>All archives</source>
        <translation>すべての圧縮ファイル</translation>
    </message>
    <message>
        <source>All pictures</source>
        <translation>すべての画像</translation>
    </message>
    <message>
        <source>All supported files</source>
        <translation>対応しているすべてのファイル</translation>
    </message>
    <message>
        <source>Choose a map or picture of your own</source>
        <translation>自分の地図または画像を選択</translation>
    </message>
    <message>
        <source>Save the film as</source>
        <translation>動画に名前を付けて保存</translation>
    </message>
    <message>
        <source>Deutsch</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <extracomment>Title of a new waypoint, followed by its number</extracomment>
        <translation>ウェイポイント</translation>
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
        <translation>ルートを GPX ファイルとして保存できませんでした。</translation>
    </message>
    <message>
        <source>This file could not be opened. It is neither a project nor a track that Tourlet can read.</source>
        <translation>このファイルを開けませんでした。Tourlet で読み込めるプロジェクトでもトラックでもありません。</translation>
    </message>
    <message>
        <source>There is not enough memory to finish this.</source>
        <translation>メモリが不足しているため、処理を完了できません。</translation>
    </message>
    <message>
        <source>The file could not be opened.</source>
        <translation>ファイルを開けませんでした。</translation>
    </message>
    <message>
        <source>The file is damaged or built in a way that Tourlet does not know.</source>
        <translation>ファイルが破損しているか、Tourlet が認識できない形式です。</translation>
    </message>
    <message>
        <source>The video components that the export needs are missing on this computer.</source>
        <translation>このコンピューターには、書き出しに必要なビデオコンポーネントがありません。</translation>
    </message>
    <message>
        <source>The film could not be exported.</source>
        <translation>動画を書き出せませんでした。</translation>
    </message>
    <message>
        <source>MP4 video (H.264)</source>
        <translation>MP4 動画 (H.264)</translation>
    </message>
    <message>
        <source>WMV video</source>
        <translation>WMV 動画</translation>
    </message>
    <message>
        <source>4K (3840 × 2160)</source>
        <translation>4K (3840 × 2160)</translation>
    </message>
    <message>
        <source>Size of the window</source>
        <translation>ウィンドウのサイズ</translation>
    </message>
    <message>
        <source>Full HD (1920 × 1080)</source>
        <translation>フル HD (1920 × 1080)</translation>
    </message>
    <message>
        <source>Français</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Français</translation>
    </message>
    <message>
        <source>Date of the file</source>
        <translation>ファイルの日付</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>ファイル名</translation>
    </message>
    <message>
        <source>Automatic</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>自動</translation>
    </message>
    <message>
        <source>Standard</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>標準</translation>
    </message>
    <message>
        <source>Strong</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>強</translation>
    </message>
    <message>
        <source>Off</source>
        <extracomment>Smoothing of recorded tracks</extracomment>
        <translation>オフ</translation>
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
        <translation>高度プロファイルのテーマを開く</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>開く</translation>
    </message>
    <message>
        <source>Loading</source>
        <extracomment>Shown while a file loads, followed by the share done in percent</extracomment>
        <translation>読み込み中</translation>
    </message>
    <message>
        <source>10 minutes</source>
        <translation>10 分</translation>
    </message>
    <message>
        <source>1 minute</source>
        <translation>1 分</translation>
    </message>
    <message>
        <source>30 minutes</source>
        <translation>30 分</translation>
    </message>
    <message>
        <source>5 minutes</source>
        <translation>5 分</translation>
    </message>
    <message>
        <source>60 minutes</source>
        <translation>60 分</translation>
    </message>
    <message>
        <source>Date taken</source>
        <extracomment>Sort photos by the date stored in the photo by the camera</extracomment>
        <translation>撮影日</translation>
    </message>
    <message>
        <source>Nederlands</source>
        <extracomment>Name of the language in the language itself; keep it unchanged in every translation</extracomment>
        <translation>Nederlands</translation>
    </message>
    <message>
        <source>Tourlet projects</source>
        <translation>Tourlet プロジェクト</translation>
    </message>
    <message>
        <source>This project has changes that are not saved yet. Save them before Tourlet closes?</source>
        <translation>このプロジェクトには保存されていない変更があります。Tourlet を終了する前に保存しますか？</translation>
    </message>
    <message>
        <source>Save altitude theme</source>
        <translation>高度プロファイルのテーマを保存</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Choose photos</source>
        <translation>写真を選択</translation>
    </message>
    <message>
        <source>Cut</source>
        <extracomment>Change between photos: straight cut</extracomment>
        <translation>カット</translation>
    </message>
    <message>
        <source>Fade</source>
        <extracomment>Change between photos: cross-fade</extracomment>
        <translation>フェード</translation>
    </message>
    <message>
        <source>Turn</source>
        <extracomment>Change between photos: the next photo turns in</extracomment>
        <translation>回転</translation>
    </message>
    <message>
        <source>Zoom</source>
        <extracomment>Change between photos: the next photo grows from the centre</extracomment>
        <translation>ズーム</translation>
    </message>
</context>
<context>
    <name>MapView</name>
    <message>
        <source>This project has changes that are not saved yet. Save them first?</source>
        <translation>このプロジェクトには保存されていない変更があります。先に保存しますか？</translation>
    </message>
    <message>
        <source>Delete this avatar?</source>
        <translation>このアバターを削除しますか？</translation>
    </message>
</context>
<context>
    <name>MessageBox</name>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Don&apos;t save</source>
        <translation>保存しない</translation>
    </message>
    <message>
        <source>Send the film</source>
        <translation>動画を送信</translation>
    </message>
    <message>
        <source>Show the tutorial</source>
        <translation>チュートリアルを表示</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Open the system settings</source>
        <translation>システム設定を開く</translation>
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
        <translation>検索中…</translation>
    </message>
    <message>
        <source>Place search needs an internet connection.</source>
        <translation>場所の検索にはインターネット接続が必要です。</translation>
    </message>
    <message>
        <source>No place found for “%1”.</source>
        <translation>「%1」に一致する場所は見つかりませんでした。</translation>
    </message>
    <message>
        <source>The place search did not work. Try again later.</source>
        <translation>場所を検索できませんでした。しばらくしてからもう一度お試しください。</translation>
    </message>
    <message>
        <source>Search a place</source>
        <translation>場所を検索</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>検索をクリア</translation>
    </message>
</context>
<context>
    <name>ProgressView</name>
    <message>
        <source>Exporting the film</source>
        <translation>動画を書き出しています</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>Share of the film exported so far</extracomment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Hide window</source>
        <translation>ウィンドウを隠す</translation>
    </message>
    <message>
        <source>Stop export</source>
        <translation>書き出しを中止</translation>
    </message>
</context>
<context>
    <name>ProjectToolBar</name>
    <message>
        <source>New project</source>
        <translation>新規プロジェクト</translation>
    </message>
    <message>
        <source>Open project</source>
        <translation>プロジェクトを開く</translation>
    </message>
    <message>
        <source>Open track</source>
        <translation>トラックを開く</translation>
    </message>
    <message>
        <source>Save project</source>
        <translation>プロジェクトを保存</translation>
    </message>
    <message>
        <source>Export route as GPX</source>
        <translation>ルートを GPX として書き出す</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>言語</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>フルスクリーン</translation>
    </message>
    <message>
        <source>Route and waypoints</source>
        <translation>ルートとウェイポイント</translation>
    </message>
</context>
<context>
    <name>RouteSettingsPage</name>
    <message>
        <source>Straight</source>
        <extracomment>How the route runs between waypoints: straight lines</extracomment>
        <translation>直線</translation>
    </message>
    <message>
        <source>Curved</source>
        <extracomment>How the route runs between waypoints: a smooth curve</extracomment>
        <translation>曲線</translation>
    </message>
    <message>
        <source>Flight</source>
        <extracomment>How the route runs between waypoints: arcs like a flight</extracomment>
        <translation>飛行</translation>
    </message>
    <message>
        <source>Route</source>
        <extracomment>How the route runs between waypoints: as a route of straight legs, not drawn as a curve</extracomment>
        <translation>ルート</translation>
    </message>
    <message>
        <source>Course</source>
        <translation>経路の形</translation>
    </message>
    <message>
        <source>A recorded track keeps its course.</source>
        <translation>記録されたトラックの経路は変わりません。</translation>
    </message>
    <message>
        <source>Colour</source>
        <translation>色</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>太さ</translation>
    </message>
    <message>
        <source>%1 px</source>
        <extracomment>A width in pixels on the screen</extracomment>
        <translation>%1 px</translation>
    </message>
    <message>
        <source>Opacity</source>
        <translation>不透明度</translation>
    </message>
    <message>
        <source>%1 %</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Shadow under the route</source>
        <translation>ルートに影を付ける</translation>
    </message>
    <message>
        <source>Shadow distance</source>
        <translation>影の距離</translation>
    </message>
    <message>
        <source>Shadow width</source>
        <translation>影の太さ</translation>
    </message>
    <message>
        <source>Shadow opacity</source>
        <translation>影の不透明度</translation>
    </message>
</context>
<context>
    <name>SettingsPanel</name>
    <message>
        <source>Route</source>
        <translation>ルート</translation>
    </message>
    <message>
        <source>Waypoint</source>
        <translation>経由地</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>Avatar</source>
        <translation>アバター</translation>
    </message>
</context>
<context>
    <name>TimelineBar</name>
    <message>
        <source>Stop the preview</source>
        <translation>プレビューを停止</translation>
    </message>
    <message>
        <source>Play the preview</source>
        <translation>プレビューを再生</translation>
    </message>
    <message>
        <source>Position in the film</source>
        <translation>映像内の位置</translation>
    </message>
    <message>
        <source>Settings of the film</source>
        <translation>映像の設定</translation>
    </message>
    <message>
        <source>Full screen</source>
        <translation>全画面表示</translation>
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
        <translation>変更するには地図上のウェイポイントをクリックします。</translation>
    </message>
    <message>
        <source>No waypoints yet. Click on the map to set one, or search for a place.</source>
        <translation>ウェイポイントはまだありません。地図をクリックして追加するか、場所を検索してください。</translation>
    </message>
    <message>
        <source>This waypoint</source>
        <translation>このウェイポイント</translation>
    </message>
    <message>
        <source>All waypoints</source>
        <translation>すべて</translation>
    </message>
    <message>
        <source>Title</source>
        <translation>タイトル</translation>
    </message>
    <message>
        <source>Symbol</source>
        <translation>シンボル</translation>
    </message>
    <message>
        <source>Size</source>
        <translation>サイズ</translation>
    </message>
    <message>
        <source>%1 %</source>
        <extracomment>A size in percent of the normal size</extracomment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Timing</source>
        <translation>時間</translation>
    </message>
    <message>
        <source>Stop at the waypoint</source>
        <translation>ウェイポイントで停止</translation>
    </message>
    <message>
        <source>On the way to the next one</source>
        <translation>次までの移動</translation>
    </message>
    <message>
        <source>Caption</source>
        <translation>ラベル</translation>
    </message>
    <message>
        <source>Font: %1, %2 pt…</source>
        <extracomment>Opens the choice of a font; %1 is the font&apos;s name, %2 its size in points</extracomment>
        <translation>フォント: %1、%2 pt…</translation>
    </message>
    <message>
        <source>Font…</source>
        <translation>フォント…</translation>
    </message>
    <message>
        <source>Frame behind the caption</source>
        <translation>ラベルに枠を付ける</translation>
    </message>
    <message>
        <source>Shadow under the caption</source>
        <translation>ラベルに影を付ける</translation>
    </message>
    <message>
        <source>Show all waypoints</source>
        <translation>すべてのウェイポイントを表示</translation>
    </message>
    <message>
        <source>Show this waypoint</source>
        <translation>このウェイポイントを表示</translation>
    </message>
    <message>
        <source>Delete waypoint</source>
        <translation>ウェイポイントを削除</translation>
    </message>
</context>
</TS>
