// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QCache>
#include <QImage>
#include <QMutex>
#include <QQuickImageProvider>

namespace HmiGuiFramework {

/// \brief Serves pictures that change at run time, such as album art or a camera's frames, by name.
///
/// `image://hmiframes/<name>[?<anything>]`; QML appends a changing query to fetch a new frame. Whoever has a frame hands
/// it over with setFrame(); all providers of the process serve the same frames. At most
/// \ref byteLimit bytes are kept, the least recently used frames go first. An unknown name gives a transparent pixel.
/// All operations are safe from any thread.
class HMIGUIFRAMEWORK_EXPORT HmiFrameProvider : public QQuickImageProvider
{
public:
    HmiFrameProvider();
    ~HmiFrameProvider() override;

    static QString imageProviderName; ///< "hmiframes"

    QImage requestImage(const QString& id, QSize* size, const QSize& requestedSize) override;

    /// \brief Keeps \a frame under \a name in place of an earlier one. A null image, or one over the limit, removes it.
    static void setFrame(const QString& name, const QImage& frame);

    /// \brief The frame of this name, or a null image.
    static QImage frame(const QString& name);

    /// \brief Forgets images scaled for a requested size; the frames themselves stay.
    void clearCache();

    static constexpr int byteLimit = 32 * 1024 * 1024; ///< bytes of all frames

private:
    QMutex m_mutex;
    QCache<QString, QImage> m_scaled;
};

} // namespace HmiGuiFramework
