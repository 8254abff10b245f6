#include "GeoPackage.h"

#include "app/Trace.h"

#include <QtEndian>

#include <sqlite3.h>

#include <cstring>

namespace {

// Reads well-known binary geometry, each part with its own byte order.
class WkbReader
{
public:
    explicit WkbReader(const QByteArray &data, int offset) : m_data(data), m_pos(offset) {}

    bool geometry(QPainterPath &path)
    {
        quint8 order = 0;
        if (!byte(order))
            return false;
        m_little = order == 1;
        quint32 type = 0;
        if (!uint32(type))
            return false;
        switch (type) {
        case 2: return lineString(path);
        case 3: return polygon(path);
        case 5:
        case 6: {
            quint32 parts = 0;
            if (!uint32(parts))
                return false;
            for (quint32 i = 0; i < parts; ++i)
                if (!geometry(path))
                    return false;
            return true;
        }
        default:
            return false; // points and 3D types don't occur in the layers we draw
        }
    }

private:
    bool byte(quint8 &value)
    {
        if (m_pos + 1 > m_data.size())
            return false;
        value = quint8(m_data.at(m_pos++));
        return true;
    }

    bool uint32(quint32 &value)
    {
        if (m_pos + 4 > m_data.size())
            return false;
        const auto *p = reinterpret_cast<const uchar *>(m_data.constData() + m_pos);
        value = m_little ? qFromLittleEndian<quint32>(p) : qFromBigEndian<quint32>(p);
        m_pos += 4;
        return true;
    }

    bool point(QPointF &p)
    {
        if (m_pos + 16 > m_data.size())
            return false;
        quint64 bits[2];
        for (quint64 &b : bits) {
            const auto *raw = reinterpret_cast<const uchar *>(m_data.constData() + m_pos);
            b = m_little ? qFromLittleEndian<quint64>(raw) : qFromBigEndian<quint64>(raw);
            m_pos += 8;
        }
        double x, y;
        std::memcpy(&x, &bits[0], 8);
        std::memcpy(&y, &bits[1], 8);
        p = QPointF(x, y);
        return true;
    }

    bool points(QPainterPath &path, bool close)
    {
        quint32 count = 0;
        if (!uint32(count) || qint64(count) * 16 > m_data.size() - m_pos)
            return false;
        for (quint32 i = 0; i < count; ++i) {
            QPointF p;
            if (!point(p))
                return false;
            if (i == 0)
                path.moveTo(p);
            else
                path.lineTo(p);
        }
        if (close && count > 0)
            path.closeSubpath();
        return true;
    }

    bool lineString(QPainterPath &path) { return points(path, false); }

    bool polygon(QPainterPath &path)
    {
        quint32 rings = 0;
        if (!uint32(rings))
            return false;
        for (quint32 i = 0; i < rings; ++i)
            if (!points(path, true))
                return false;
        return true;
    }

    const QByteArray &m_data;
    int m_pos;
    bool m_little = true;
};

// The path of one standard GeoPackage geometry blob.
bool parseGeoPackageGeometry(const QByteArray &blob, QPainterPath &path)
{
    // "GP", version, flags, srs id, then an envelope whose size the flags give.
    if (blob.size() < 8 || blob.at(0) != 'G' || blob.at(1) != 'P')
        return false;
    const int envelope = (quint8(blob.at(3)) >> 1) & 0x7;
    static const int envelopeBytes[] = {0, 32, 48, 48, 64};
    if (envelope > 4)
        return false;
    path = QPainterPath();
    path.setFillRule(Qt::OddEvenFill);
    WkbReader reader(blob, 8 + envelopeBytes[envelope]);
    return reader.geometry(path);
}

} // namespace

bool readGeoPackageLayer(const QString &file, const QString &layer, const QString &labelColumn,
                         std::vector<GeoFeature> &features)
{
    sqlite3 *db = nullptr;
    if (sqlite3_open_v2(file.toUtf8().constData(), &db, SQLITE_OPEN_READONLY, nullptr) != SQLITE_OK) {
        logTrace(3, QStringLiteral("contentgen: can't open %s"), file);
        sqlite3_close(db);
        return false;
    }
    const QByteArray sql = QStringLiteral("SELECT geom, \"%1\" FROM \"%2\"").arg(labelColumn, layer).toUtf8();
    sqlite3_stmt *statement = nullptr;
    bool ok = sqlite3_prepare_v2(db, sql.constData(), -1, &statement, nullptr) == SQLITE_OK;
    if (!ok)
        logTrace(3, QStringLiteral("contentgen: no layer %s in %s: %s"), layer, file, sqlite3_errmsg(db));
    while (ok) {
        const int step = sqlite3_step(statement);
        if (step == SQLITE_DONE)
            break;
        if (step != SQLITE_ROW) {
            logTrace(3, QStringLiteral("contentgen: reading %s failed: %s"), layer, sqlite3_errmsg(db));
            ok = false;
            break;
        }
        const auto *bytes = static_cast<const char *>(sqlite3_column_blob(statement, 0));
        const QByteArray blob(bytes, sqlite3_column_bytes(statement, 0));
        GeoFeature feature;
        feature.label = QString::fromUtf8(reinterpret_cast<const char *>(sqlite3_column_text(statement, 1)));
        if (blob.isEmpty())
            continue;
        if (!parseGeoPackageGeometry(blob, feature.outline)) {
            logTrace(3, QStringLiteral("contentgen: damaged geometry in %s (%s)"), layer, feature.label);
            ok = false;
            break;
        }
        features.push_back(std::move(feature));
    }
    sqlite3_finalize(statement);
    sqlite3_close(db);
    return ok;
}
