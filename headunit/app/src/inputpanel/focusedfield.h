// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QPointer>

QT_BEGIN_NAMESPACE
class QQuickItem;
QT_END_NAMESPACE

/// \brief The text field that has the focus, and what an input panel does to it. GUI thread only.
///
/// Without one, its operations do nothing. No text that passes here is ever logged.
class FocusedField : public QObject
{
    Q_OBJECT

public:
    explicit FocusedField(QObject* parent);

    /// \brief Whether whatever has the focus takes text.
    static bool isTyping();

    bool exists() const { return m_field; }
    Qt::InputMethodHints hints() const;
    QString textBeforeCursor() const;
    /// \brief The lower edge of the field, in pixels from the top of \a layer; 0 when there is none on it.
    double bottomOn(const QQuickItem* layer) const;

    void commit(const QString& text); ///< puts a text in place of the preliminary one
    /// \brief Shows a text at the cursor that is not decided on.
    void setPreliminary(const QString& text);
    void press(Qt::Key key); ///< as a keyboard does
    void leave();            ///< takes the focus away

Q_SIGNALS:
    /// \brief Another field, or none any more.
    void changed();

private:
    void follow(QObject* focus);
    QVariant ask(Qt::InputMethodQuery query) const;

    QPointer<QObject> m_field;
};
