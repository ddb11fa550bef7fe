// SPDX-License-Identifier: MIT
#pragma once

#include "mappainter.h"
#include "navigator.h"

#include <QPointer>
#include <QQuickItem>
#include <QThread>

/// \brief A map that is moved and zoomed. QML knows it as `NavigationMap` of the module HmiNavigation. GUI thread only.
///
/// What is on the screen is a part of a larger picture, which a thread of its own draws anew when the map comes near its edge,
/// is zoomed or gets other colours; until then the old one is shown in its place. A frame therefore costs no more than an image.
class MapItem : public QQuickItem
{
    Q_OBJECT
    Q_PROPERTY(Navigator* navigator READ navigator WRITE setNavigator NOTIFY navigatorChanged)
    Q_PROPERTY(QVariantMap colors READ colors WRITE setColors NOTIFY colorsChanged)
    Q_PROPERTY(QFont font READ font WRITE setFont NOTIFY fontChanged)
    Q_PROPERTY(qreal unit READ unit WRITE setUnit NOTIFY unitChanged)
    Q_PROPERTY(QPointF pivot READ pivot WRITE setPivot NOTIFY pivotChanged)
    Q_PROPERTY(bool immediate MEMBER m_immediate NOTIFY immediateChanged)
    Q_PROPERTY(bool following READ isFollowing WRITE setFollowing NOTIFY followingChanged)
    Q_PROPERTY(qreal zoom READ zoom NOTIFY viewChanged)
    Q_PROPERTY(QPointF vehicle READ vehicle NOTIFY viewChanged)

public:
    explicit MapItem(QQuickItem* parent = nullptr);
    ~MapItem() override;

    Navigator* navigator() const { return m_navigator; }
    void setNavigator(Navigator* navigator);
    QVariantMap colors() const { return m_colors; } ///< by name, see MapPainter
    void setColors(const QVariantMap& colors);
    QFont font() const { return m_font; } ///< of names on the map
    void setFont(const QFont& font);
    qreal unit() const { return m_unit; } ///< pixels of a reference pixel
    void setUnit(qreal unit);
    QPointF pivot() const { return m_pivot; } ///< pixel that shows the centre of the map
    void setPivot(const QPointF& point);
    bool isFollowing() const { return m_following; } ///< the vehicle is the centre
    void setFollowing(bool following);
    qreal zoom() const { return m_zoom; } ///< pixels per metre
    QPointF centre() const { return m_centre; }
    QPointF vehicle() const; ///< pixel of the vehicle; may lie outside

    /// \brief Moves the map by pixels; it no longer follows the vehicle.
    Q_INVOKABLE void panBy(qreal x, qreal y);
    /// \brief Zooms by a factor, within limits, around the pivot.
    Q_INVOKABLE void zoomBy(qreal factor);

Q_SIGNALS:
    void navigatorChanged();
    void colorsChanged();
    void fontChanged();
    void unitChanged();
    void pivotChanged();
    void immediateChanged();
    void followingChanged();
    void viewChanged();
    void drawn(); ///< a new picture is shown

protected:
    QSGNode* updatePaintNode(QSGNode* node, UpdatePaintNodeData*) override;
    void updatePolish() override;
#if QT_VERSION < QT_VERSION_CHECK(6, 0, 0)
    void geometryChanged(const QRectF& now, const QRectF& before) override;
#else
    void geometryChange(const QRectF& now, const QRectF& before) override;
#endif

private:
    void follow();
    void redraw();
    void changeView();
    bool isEnough() const;
    QRectF visibleArea() const;
    MapPicture wanted() const;
    void show(const MapPicture& picture, const QImage& image);

    QPointer<Navigator> m_navigator;
    QVariantMap m_colors;
    QFont m_font;
    qreal m_unit = 1;
    QPointF m_pivot;
    QPointF m_centre;
    qreal m_zoom = 0.4;
    bool m_following = true;
    bool m_immediate = false;

    QThread m_thread;
    QObject m_drawer; ///< lives in the thread; pictures are drawn there, one after the other
    bool m_isDrawing = false;
    bool m_isStale = true; ///< the picture shows something that has changed
    MapPicture m_picture;  ///< that is shown, or drawn at the moment
    QImage m_image;
    QRectF m_imageArea; ///< metres that the image shows
    bool m_imageIsNew = false;
};
