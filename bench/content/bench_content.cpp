// Start-up scan of a generated catalogue: 400 avatars, 400 waypoint symbols,
// 100 maps and 20 masks in 10 folders, with group lists and translations.
#include "content/ContentCatalogue.h"
#include "content/ContentIni.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

namespace {

void write(const QString &path, const QByteArray &bytes)
{
    QDir().mkpath(QFileInfo(path).path());
    QFile f(path);
    if (f.open(QIODevice::WriteOnly))
        f.write(bytes);
}

void fillFolder(const QString &folder, const char *kind, int count, int offset)
{
    QByteArray translation;
    QByteArray sections;
    for (int g = 0; g < 8; ++g) {
        sections += QByteArray("group") + QByteArray::number(g) + ";";
        translation += "[group" + QByteArray::number(g) + "]\nname=Group " + QByteArray::number(g) + ", \"quoted\"\n";
    }
    for (int i = 0; i < count; ++i) {
        const QByteArray stem = QByteArray(kind) + QByteArray::number(offset + i);
        QByteArray ini = "; generated\n[main]\ntype=png\ncPack=" + QByteArray(i % 3 ? "UTP" : "none") + "\n";
        if (qstrcmp(kind, "avatar") == 0)
            ini += "gName=group" + QByteArray::number(i % 9) + "\nallowRotation=true\nsymmetric=false\nanimated=false\n"
                   "displayFormat=" + (i % 4 ? "2D" : "perspective") + "\nisUserContent=false\n";
        if (qstrcmp(kind, "waypoint") == 0)
            ini += "animated=true\nmedia=true\nmediaCPOx=10.5\nmediaCPOy=4\nmediaW=80\nmediaH=60\n";
        if (qstrcmp(kind, "map") == 0) {
            ini += "item_main_category=world_shop\norigins=map." + stem + "\nbackground=#112233\nwidthWeight=1.5\n";
            translation += "[" + stem + "]\nname=Map " + stem + "\n";
        }
        if (qstrcmp(kind, "mask") == 0)
            ini += "guid={11111111-2222-3333-4444-" + QByteArray::number(100000000000LL + i) + "}\n";
        write(folder + QStringLiteral("informations/") + QString::fromLatin1(stem) + QStringLiteral(".ini"), ini);
    }
    write(folder + QStringLiteral("categories.ini"), "[main]\nsections=" + sections + "\n");
    write(folder + QStringLiteral("Translation_EN.ini"), translation);
}

struct GeneratedContent
{
    QTemporaryDir dir;
    QString root;
    QString data;

    GeneratedContent()
    {
        root = dir.filePath(QStringLiteral("imgsrc/"));
        data = dir.filePath(QStringLiteral("data"));
        // Avatars in 4 folders, waypoints in 2, maps in 3, masks in 1.
        const QStringList avatarFolders = {root + QStringLiteral("avatars/"), root + QStringLiteral("_shop/Transport/"),
                                           root + QStringLiteral("_shop/Vehicles/"), root + QStringLiteral("_shop/tee/")};
        for (int i = 0; i < avatarFolders.size(); ++i)
            fillFolder(avatarFolders.at(i), "avatar", 100, i * 100);
        fillFolder(root + QStringLiteral("waypoints/"), "waypoint", 200, 0);
        fillFolder(root + QStringLiteral("_shop/WayPoints/"), "waypoint", 200, 200);
        fillFolder(root + QStringLiteral("maps/"), "map", 40, 0);
        fillFolder(root + QStringLiteral("_shop/Maps_Continents/"), "map", 30, 40);
        fillFolder(data + QStringLiteral("/extraMaps/"), "map", 30, 70);
        fillFolder(root + QStringLiteral("masks/"), "mask", 20, 0);
        write(data + QStringLiteral("/tourletContent.ini"),
              "[maps]\npaths=" + QFile::encodeName(data + QStringLiteral("/extraMaps")) + "\n");
    }
};

void BM_CatalogueLoad(benchmark::State &state)
{
    GeneratedContent content;
    size_t items = 0;
    for (auto _ : state) {
        ContentCatalogue catalogue;
        catalogue.load(content.root, content.data);
        items = catalogue.avatars().size() + catalogue.waypoints().size() + catalogue.maps().size()
                + catalogue.masks().size();
        benchmark::DoNotOptimize(items);
    }
    state.counters["items"] = double(items);
    if (items != 920)
        state.SkipWithError("generated catalogue incomplete");
}
BENCHMARK(BM_CatalogueLoad)->Unit(benchmark::kMillisecond)->MinTime(2.0);

void BM_ContentIniParse(benchmark::State &state)
{
    QByteArray text = "[main]\n";
    for (int i = 0; i < 200; ++i)
        text += "key" + QByteArray::number(i) + " = value, with; \"quotes\" and \\ backslash\n";
    for (auto _ : state) {
        QSettings::SettingsMap map;
        ContentIni::parse(text, map);
        benchmark::DoNotOptimize(map);
    }
    state.SetBytesProcessed(int64_t(state.iterations()) * text.size());
}
BENCHMARK(BM_ContentIniParse)->Unit(benchmark::kMicrosecond);

} // namespace

BENCHMARK_MAIN();
