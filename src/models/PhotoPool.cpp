#include "models/PhotoPool.h"

#include "app/Trace.h"
#include "path/ContentPath.h"
#include "path/PointRecord.h"
#include "project/ProjectController.h"

#include <QFileInfo>
#include <QImage>
#include <QImageReader>

namespace {

const QString poolSection = QStringLiteral("photopool");
const QString fullFrameSection = QStringLiteral("fullframe");

// Width and height of a picture; the header is enough for most formats.
QSize pictureSize(const QString &file)
{
    QImageReader reader(file);
    const QSize size = reader.size();
    if (size.isValid())
        return size;
    return reader.read().size();
}

} // namespace

QString photoPoolItemSection(int index)
{
    return QStringLiteral("%1_item%2").arg(poolSection).arg(index);
}

PoolPhoto PhotoPool::add(const QString &path, int32_t sizeW, int32_t sizeH)
{
    for (const PoolPhoto &photo : photos) {
        if (photo.path == path)
            return photo;
    }
    PoolPhoto photo;
    photo.id = drawPhotoId();
    photo.path = path;
    photo.sizeW = sizeW;
    photo.sizeH = sizeH;
    photo.readMetadata();
    if (!photo.captureDate.isEmpty())
        photo.time = photo.captureDate;
    photos.push_back(photo);
    return photo;
}

bool PhotoPool::remove(int32_t id)
{
    for (auto it = photos.begin(); it != photos.end(); ++it) {
        if (it->id == id) {
            photos.erase(it);
            return true;
        }
    }
    return false;
}

PoolPhoto *PhotoPool::find(int32_t id)
{
    for (PoolPhoto &photo : photos) {
        if (photo.id == id)
            return &photo;
    }
    return nullptr;
}

int PhotoPool::selectedCount() const
{
    int count = 0;
    for (const PoolPhoto &photo : photos)
        count += photo.isSelected() ? 1 : 0;
    return count;
}

void PhotoPool::clear()
{
    photos.clear();
}

bool PhotoPool::setFullFrameBorderEffect(bool on)
{
    const bool changed = on != fullFrameBorderEffect;
    fullFrameBorderEffect = on;
    return changed;
}

bool PhotoPool::setFullFrameCropping(bool on)
{
    const bool changed = on != fullFrameCropping;
    fullFrameCropping = on;
    return changed;
}

void PhotoPool::Save(ProjectController &store) const
{
    PointRecordWriter(store, poolSection).write(QStringLiteral("size"), int32_t(photos.size()));
    for (size_t i = 0; i < photos.size(); ++i) {
        const PoolPhoto &photo = photos[i];
        const PointRecordWriter out(store, photoPoolItemSection(int(i)));
        out.write(QStringLiteral("id"), photo.id);
        out.write(QStringLiteral("flags"), photo.flags);
        out.write(QStringLiteral("orderId"), photo.orderId);
        out.write(QStringLiteral("sizeW"), photo.sizeW);
        out.write(QStringLiteral("sizeH"), photo.sizeH);
        out.write(QStringLiteral("path"), photo.path);
        out.write(QStringLiteral("time"), photo.time);
    }
    const PointRecordWriter fullFrame(store, fullFrameSection);
    fullFrame.write(QStringLiteral("borderEffect"), fullFrameBorderEffect);
    fullFrame.write(QStringLiteral("cropping"), fullFrameCropping);
}

void PhotoPool::Load(ProjectController &store)
{
    int32_t size = 0;
    PointRecordReader(store, poolSection).read(QStringLiteral("size"), size);
    if (size > 0)
        photos.clear();
    const std::vector<int32_t> present = store.numberedSections(poolSection + QStringLiteral("_item"), size);
    if (present.size() != size_t(std::max(size, 0)))
        logTrace(3, QStringLiteral("PhotoPool::Load -> %d of %d photo sections present"), int(present.size()), size);
    for (const int32_t i : present) {
        const PointRecordReader in(store, photoPoolItemSection(i));
        PoolPhoto photo;
        photo.id = drawPhotoId();
        in.read(QStringLiteral("flags"), photo.flags);
        in.read(QStringLiteral("orderId"), photo.orderId);
        in.read(QStringLiteral("path"), photo.path);
        in.read(QStringLiteral("time"), photo.time);
        in.read(QStringLiteral("sizeW"), photo.sizeW);
        in.read(QStringLiteral("sizeH"), photo.sizeH);
        if (photo.sizeW == 0 || photo.sizeH == 0) {
            const QString file = localFilePath(photo.path);
            if (QFileInfo(file).isFile()) {
                const QSize size = pictureSize(file);
                if (size.isValid()) {
                    photo.sizeW = size.width();
                    photo.sizeH = size.height();
                }
            }
        }
        photo.readMetadata();
        photos.push_back(photo);
    }
    const PointRecordReader fullFrame(store, fullFrameSection);
    fullFrame.read(QStringLiteral("borderEffect"), fullFrameBorderEffect);
    fullFrame.read(QStringLiteral("cropping"), fullFrameCropping);
}
