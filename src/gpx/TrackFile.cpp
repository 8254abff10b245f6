#include "gpx/TrackFile.h"

#include "app/Trace.h"
#include "gpx/KmlReader.h"
#include "gpx/KmzArchive.h"
#include "gpx/TcxReader.h"
#include "gpx/TrkReader.h"

#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

#include <algorithm>

bool TrackFile::load(const QString &fileName)
{
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly)) {
        logTrace(0, QStringLiteral("File open error: %s"), file.errorString());
        return false;
    }
    // A pipe or device could deliver data without end.
    if (file.isSequential()) {
        logTrace(0, QStringLiteral("File open error: %s"), QStringLiteral("not a regular file"));
        return false;
    }

    // Even the tersest formats spend some 40 bytes on a point.
    m_items.setExpectedPoints(int(std::min<qint64>(file.size() / 40, 1 << 26)));

    const QString suffix = QFileInfo(fileName).suffix();
    if (suffix == QLatin1String("kmz")) {
        file.close();
        return loadKmz(fileName);
    }

    // Opened without text mode: the parsers handle every kind of line end themselves.
    const bool parsed = suffix.compare(QLatin1String("trk"), Qt::CaseInsensitive) == 0 ? readTrk(&file) : readXml(&file);
    m_xml.setDevice(nullptr);
    return parsed && !m_items.items().empty();
}

bool TrackFile::readXml(QIODevice *device)
{
    m_header = GpxHeader();
    m_items.clear();
    m_xml.setDevice(device);
    if (!m_xml.readNextStartElement())
        return false;
    if (m_xml.name() == QLatin1String("gpx"))
        return GpxReader(m_xml, m_items, m_header).read();
    if (m_xml.name() == QLatin1String("kml"))
        return KmlReader(m_xml, m_items).read();
    if (m_xml.name() == QLatin1String("TrainingCenterDatabase"))
        return TcxReader(m_xml, m_items).read();
    return false;
}

bool TrackFile::readTrk(QIODevice *device)
{
    m_header = GpxHeader();
    m_items.clear();
    return TrkReader(m_items).read(*device);
}

// Of several documents in one archive only the first is read, and the answer is false,
// as the others can't be opened.
bool TrackFile::loadKmz(const QString &fileName)
{
    KmzArchive archive;
    if (!archive.open(fileName))
        return false;
    const QStringList documents = archive.documents();
    if (documents.isEmpty())
        return false;
    QTemporaryDir folder;
    if (!folder.isValid())
        return false;
    const QString document = folder.filePath(QStringLiteral("doc.kml"));
    if (!archive.extractDocument(0, document))
        return false;
    bool result = load(document);
    for (int i = 1; i < documents.size(); ++i) {
        logTrace(0, QStringLiteral("File open error: %s"), QStringLiteral("%1 is not read").arg(documents.at(i)));
        result = false;
    }
    return result;
}

int TrackFile::selectItem()
{
    std::vector<TrackItem> &items = m_items.items();
    if (items.empty())
        return -1;
    for (size_t i = 0; i < items.size(); ++i) {
        if (items[i].type == TrackItem::Track)
            return int(i);
    }
    TrackItem &last = items.back();
    if (last.points.size() > 100)
        last.fixedGpxPath = true;
    return int(items.size() - 1);
}
