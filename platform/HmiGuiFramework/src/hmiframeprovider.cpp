// SPDX-License-Identifier: MIT
#include "hmiframeprovider.h"

namespace HmiGuiFramework {

QString HmiFrameProvider::imageProviderName = QStringLiteral("hmiframes");

namespace {

constexpr int scaledLimit = 8 * 1024 * 1024; // bytes

struct Frames
{
    QMutex mutex;
    QCache<QString, QImage> byName{HmiFrameProvider::byteLimit};
};

Frames& frames()
{
    static Frames instance;
    return instance;
}

QImage transparentPixel()
{
    QImage pixel(1, 1, QImage::Format_ARGB32_Premultiplied);
    pixel.fill(Qt::transparent);
    return pixel;
}

} // namespace

HmiFrameProvider::HmiFrameProvider()
    : QQuickImageProvider(QQuickImageProvider::Image)
    , m_scaled(scaledLimit)
{
}

HmiFrameProvider::~HmiFrameProvider() = default;

void HmiFrameProvider::setFrame(const QString& name, const QImage& frame)
{
    const QMutexLocker lock(&frames().mutex);
    if (frame.isNull())
        frames().byName.remove(name);
    else
        frames().byName.insert(name, new QImage(frame), int(qMin<qsizetype>(frame.sizeInBytes(), byteLimit + 1)));
}

QImage HmiFrameProvider::frame(const QString& name)
{
    const QMutexLocker lock(&frames().mutex);
    const QImage* const found = frames().byName.object(name);
    return found ? *found : QImage();
}

QImage HmiFrameProvider::requestImage(const QString& id, QSize* size, const QSize& requestedSize)
{
    QImage image = frame(id.section(QLatin1Char('?'), 0, 0));
    if (image.isNull())
        image = transparentPixel();
    else if (requestedSize.width() > 0 && requestedSize.height() > 0 && requestedSize != image.size()) {
        const QString key =
            QStringLiteral("%1@%2x%3").arg(image.cacheKey()).arg(requestedSize.width()).arg(requestedSize.height());
        const QMutexLocker lock(&m_mutex);
        if (const QImage* const scaled = m_scaled.object(key)) {
            image = *scaled;
        } else {
            image = image.scaled(requestedSize, Qt::KeepAspectRatioByExpanding, Qt::SmoothTransformation);
            m_scaled.insert(key, new QImage(image), int(image.sizeInBytes()));
        }
    }
    if (size)
        *size = image.size();
    return image;
}

void HmiFrameProvider::clearCache()
{
    const QMutexLocker lock(&m_mutex);
    m_scaled.clear();
}

} // namespace HmiGuiFramework
