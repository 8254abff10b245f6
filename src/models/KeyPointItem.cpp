#include "models/KeyPointItem.h"

#include "content/ContentItems.h"
#include "path/KeyPoint.h"

namespace {

namespace StyleBit {
constexpr uint32_t bold = 1, italic = 2, underline = 4, overline = 8, strikeOut = 16;
}

} // namespace

QString interfaceFileUrl(const QString &stored)
{
    return stored.isEmpty() || stored.startsWith(QLatin1String("file:")) ? stored : contentFileUrl(stored);
}

QFont keyPointQFont(const KeyPointFont &font)
{
    QFont out(font.family);
    if (font.pointSize > 0)
        out.setPointSizeF(font.pointSize);
    out.setBold(font.style & StyleBit::bold);
    out.setItalic(font.style & StyleBit::italic);
    out.setUnderline(font.style & StyleBit::underline);
    out.setOverline(font.style & StyleBit::overline);
    out.setStrikeOut(font.style & StyleBit::strikeOut);
    return out;
}

void setKeyPointFont(KeyPointFont &font, const QFont &from)
{
    font.family = from.family();
    if (from.pointSizeF() > 0)
        font.pointSize = from.pointSizeF();
    font.style = (from.weight() > QFont::Medium ? StyleBit::bold : 0) | (from.italic() ? StyleBit::italic : 0)
                 | (from.underline() ? StyleBit::underline : 0) | (from.overline() ? StyleBit::overline : 0)
                 | (from.strikeOut() ? StyleBit::strikeOut : 0);
}

void KeyPointItem::assignFrom(const KeyPoint &point)
{
    const KeyPointProperties &p = point.properties;
    elementId = point.id;
    enabled = p.enabled;
    pauseDuration = p.durationPause;
    animationDuration = p.durationToNextKP;
    size = p.size;
    keyPointFontShadow = p.font.hasShadow;
    keyPointFontFrame = p.font.hasFrame;
    isMediaTemplate = p.isMediaTemplate;
    title = p.title;
    keyPointFont = keyPointQFont(p.font);
    mediaFileOrientation = p.mediaRotation;
    keyPointImageSource = p.imageSource;
    mediaFileName = interfaceFileUrl(p.mediaSource);
    mediaCenterPositionOffset = QPointF(p.mediaCenterOffsetX, p.mediaCenterOffsetY);
    mediaSourceSize = QSizeF(p.mediaSizeW, p.mediaSizeH);
    keyPointFontColor = QColor(p.font.color);
}

QVariantMap KeyPointItem::toMap() const
{
    return {{QStringLiteral("elementId"), int(elementId)},
            {QStringLiteral("title"), title},
            {QStringLiteral("enabled"), enabled},
            {QStringLiteral("pauseDuration"), pauseDuration},
            {QStringLiteral("animationDuration"), animationDuration},
            {QStringLiteral("keyPointFontShadow"), keyPointFontShadow},
            {QStringLiteral("keyPointFontFrame"), keyPointFontFrame},
            {QStringLiteral("keyPointFontColor"), keyPointFontColor},
            {QStringLiteral("keyPointFont"), keyPointFont},
            {QStringLiteral("size"), size},
            {QStringLiteral("keyPointImageSource"), keyPointImageSource},
            {QStringLiteral("mediaFileName"), mediaFileName},
            {QStringLiteral("mediaFileOrientation"), mediaFileOrientation},
            {QStringLiteral("isMediaTemplate"), isMediaTemplate},
            {QStringLiteral("mediaCenterPositionOffset"), mediaCenterPositionOffset},
            {QStringLiteral("mediaSourceSize"), mediaSourceSize},
            {QStringLiteral("enabledForAnimation"), enabledForAnimation}};
}
