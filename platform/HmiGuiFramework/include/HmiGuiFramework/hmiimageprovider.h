// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QCache>
#include <QImage>
#include <QMutex>
#include <QQuickImageProvider>

namespace HmiGuiFramework {

/// \brief Serves the product's icons by name, in colours of the palette in force.
///
/// `image://hmiimages/<name>[?color=<role or #rrggbb>]`: the file `<name>.svg` or `<name>.png` of the resource folder
/// ":/icons" or of "icons/" under AppSettings::mainFolderPath. An SVG's parts that are drawn in `currentColor` get the
/// colour asked for, by default that of the role "text". Without a requested size an icon has its own. An unknown
/// name gives one warning and an empty image. Images are kept in a cache of 8 MiB. requestImage() may be called from any
/// thread.
class HMIGUIFRAMEWORK_EXPORT HmiImageProvider : public QQuickImageProvider
{
public:
    HmiImageProvider();
    ~HmiImageProvider() override;

    static QString imageProviderName; ///< "hmiimages"

    QImage requestImage(const QString& id, QSize* size, const QSize& requestedSize) override;

    /// \brief Forgets all images, for example because the palette has changed.
    void clearCache();

    /// \brief Bytes of image data in the cache, at most \ref cacheLimit.
    int cachedBytes() const;

    static constexpr int cacheLimit = 8 * 1024 * 1024; ///< bytes

private:
    mutable QMutex m_mutex;
    QCache<QString, QImage> m_cache;
};

} // namespace HmiGuiFramework
