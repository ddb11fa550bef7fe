// SPDX-License-Identifier: MIT
#include "hmiimageprovider.h"

#include "appsettings.h"
#include "currentpalette.h"
#include "guicategory.h"

#include <QBuffer>
#include <QColor>
#include <QFile>
#include <QImageReader>
#include <QPainter>
#include <QUrlQuery>

namespace HmiGuiFramework {

QString HmiImageProvider::imageProviderName = QStringLiteral("hmiimages");

namespace {

constexpr int largestSide = 2048; // pixels; a larger request is a mistake in QML

/// The icon's file, or an empty string. Names cannot lead out of the icon folders.
QString fileOf(const QString& name)
{
    if (name.isEmpty() || name.contains(QLatin1String("..")))
        return QString();
    const QString folders[] = {QStringLiteral(":/icons/"), AppSettings::mainFolderPath + QStringLiteral("icons/")};
    for (const QString& folder : folders)
        for (const char* const suffix : {".svg", ".png"})
            if (const QString file = folder + name + QLatin1String(suffix); QFile::exists(file))
                return file;
    return QString();
}

QImage withOpacity(const QImage& image, qreal opacity)
{
    QImage faded(image.size(), QImage::Format_ARGB32_Premultiplied);
    faded.fill(Qt::transparent);
    QPainter painter(&faded);
    painter.setOpacity(opacity);
    painter.drawImage(0, 0, image);
    painter.end();
    return faded.copy(); // without the paint engine, which an image keeps once it was painted on
}

/// Through the image format plugin: the SVG library is large, and loaded with the first icon only.
QImage drawSvg(const QString& file, const QColor& color, const QSize& requestedSize)
{
    QFile svg(file);
    if (!svg.open(QIODevice::ReadOnly))
        return QImage();
    QByteArray text = svg.readAll().replace("currentColor", color.name().toLatin1());
    QBuffer buffer(&text);
    QImageReader reader(&buffer, "svg");
    if (requestedSize.isValid()) {
        QSize size = reader.size();
        size.scale(requestedSize.boundedTo(QSize(largestSide, largestSide)), Qt::KeepAspectRatio);
        reader.setScaledSize(size);
    }
    const QImage image = reader.read();
    if (image.isNull())
        return image;
    return color.alpha() < 255 ? withOpacity(image, color.alphaF()) : image.copy();
}

QImage draw(const QString& file, const QColor& color, const QSize& requestedSize)
{
    if (file.endsWith(QLatin1String(".svg")))
        return drawSvg(file, color, requestedSize);
    const QImage image(file);
    if (!requestedSize.isValid() || image.isNull())
        return image;
    return image.scaled(requestedSize.boundedTo(QSize(largestSide, largestSide)), Qt::KeepAspectRatio,
                        Qt::SmoothTransformation);
}

/// QML's sourceSize may give one side only.
QSize complete(const QSize& requested)
{
    if (requested.width() > 0 && requested.height() <= 0)
        return QSize(requested.width(), largestSide);
    if (requested.height() > 0 && requested.width() <= 0)
        return QSize(largestSide, requested.height());
    return requested.isEmpty() ? QSize() : requested;
}

} // namespace

HmiImageProvider::HmiImageProvider()
    : QQuickImageProvider(QQuickImageProvider::Image)
    , m_cache(cacheLimit)
{
}

HmiImageProvider::~HmiImageProvider() = default;

QImage HmiImageProvider::requestImage(const QString& id, QSize* size, const QSize& requestedSize)
{
    const QString key = QStringLiteral("%1@%2x%3").arg(id).arg(requestedSize.width()).arg(requestedSize.height());
    {
        const QMutexLocker lock(&m_mutex);
        if (const QImage* const cached = m_cache.object(key)) {
            if (size)
                *size = cached->size();
            return *cached;
        }
    }
    const QString name = id.section(QLatin1Char('?'), 0, 0);
    const QUrlQuery query(id.section(QLatin1Char('?'), 1));
    const QString wanted = query.queryItemValue(QStringLiteral("color"), QUrl::FullyDecoded);
    QColor color = CurrentPalette::color(wanted.isEmpty() ? QStringLiteral("text") : wanted);
    if (!color.isValid())
        color = Qt::white;
    const QString file = fileOf(name);
    const QImage image = file.isEmpty() ? QImage() : draw(file, color, complete(requestedSize));
    if (image.isNull())
        qCWarning(guiCategory).noquote() << "icon" << name.left(128)
                                         << (file.isEmpty() ? "does not exist" : "cannot be drawn");
    if (size)
        *size = image.size();
    const QMutexLocker lock(&m_mutex);
    m_cache.insert(key, new QImage(image), qMax(1, int(image.sizeInBytes())));
    return image;
}

void HmiImageProvider::clearCache()
{
    const QMutexLocker lock(&m_mutex);
    m_cache.clear();
}

int HmiImageProvider::cachedBytes() const
{
    const QMutexLocker lock(&m_mutex);
    return int(m_cache.totalCost());
}

} // namespace HmiGuiFramework
