// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QObject>
#include <QUrl>

namespace HmiGuiFramework {

/// \brief An entry of a menu. GUI thread only. Setters emit only on a change.
class HMIGUIFRAMEWORK_EXPORT HmiAction : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString text READ text WRITE setText NOTIFY textChanged)
    Q_PROPERTY(QString icon READ icon WRITE setIcon NOTIFY iconChanged)
    Q_PROPERTY(int order READ order WRITE setOrder NOTIFY orderChanged)
    Q_PROPERTY(bool enabled READ isEnabled WRITE setEnabled NOTIFY enabledChanged)

public:
    explicit HmiAction(QObject* parent = nullptr);
    ~HmiAction() override;

    QString text() const { return m_text; } ///< shown text, already translated
    void setText(const QString& text);

    QString icon() const { return m_icon; } ///< icon's name for HmiImageProvider, or empty
    void setIcon(const QString& icon);

    int order() const { return m_order; } ///< place in the menu, smallest first; 0 by default
    void setOrder(int order);

    bool isEnabled() const { return m_enabled; } ///< true by default
    void setEnabled(bool enabled);

public Q_SLOTS:
    /// \brief Emits triggered(), unless the action is disabled.
    void trigger();

Q_SIGNALS:
    void textChanged();
    void iconChanged();
    void orderChanged();
    void enabledChanged();
    void triggered(); ///< chosen by the user, while enabled

private:
    QString m_text;
    QString m_icon;
    int m_order = 0;
    bool m_enabled = true;
};

} // namespace HmiGuiFramework
