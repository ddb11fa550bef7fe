// SPDX-License-Identifier: MIT
#pragma once

#include "messagemodel.h"

#include <QObject>
#include <QStringList>

/// \brief The messages, and the one that is read. GUI thread only.
///
/// The bridge has no text messages. They come by the intent `AddMessage` from whoever has them; answers are only kept with the
/// message. A maker connects both to the phone. Missed calls and notices come from VehicleNotices.
class MessageCenter : public QObject
{
    Q_OBJECT
    Q_PROPERTY(MessageModel* model READ model CONSTANT)
    Q_PROPERTY(bool isOpen READ isOpen NOTIFY currentChanged)
    Q_PROPERTY(QString sender READ sender NOTIFY currentChanged)
    Q_PROPERTY(QString text READ text NOTIFY currentChanged)
    Q_PROPERTY(QString time READ time NOTIFY currentChanged)
    Q_PROPERTY(QString icon READ icon NOTIFY currentChanged)
    Q_PROPERTY(QString number READ number NOTIFY currentChanged)
    Q_PROPERTY(QString place READ place NOTIFY currentChanged)
    Q_PROPERTY(bool answerable READ isAnswerable NOTIFY currentChanged)
    Q_PROPERTY(QString answer READ answer NOTIFY currentChanged)
    Q_PROPERTY(QString newestIcon READ newestIcon NOTIFY arrived)
    Q_PROPERTY(QString newestSender READ newestSender NOTIFY arrived)
    Q_PROPERTY(QStringList answers READ answers NOTIFY answersChanged)

public:
    explicit MessageCenter(QObject* parent);

    MessageModel* model() { return &m_model; }

    /// \brief Takes a message in; it gets the present time of the vehicle.
    void add(Message message);

    bool isOpen() const { return m_row >= 0; }
    QString sender() const { return current().shownSender(); }
    QString text() const { return current().shownText(); }
    QString time() const { return current().time; }
    QString icon() const { return current().icon(); }
    QString number() const { return current().number; }
    QString place() const { return current().place; }
    bool isAnswerable() const; ///< a text from somebody, not answered yet
    QString answer() const;    ///< that was sent; empty for none
    QStringList answers() const;
    QString newestIcon() const { return newest().icon(); }
    QString newestSender() const { return newest().shownSender(); }

    /// \brief Reads the message in \a row from now on. False when there is none.
    Q_INVOKABLE bool open(int row);
    /// \brief Answers the message that is read with one of answers(). Without effect when that is not possible.
    Q_INVOKABLE void sendAnswer(int answer);
    /// \brief Removes the message that is read.
    Q_INVOKABLE void removeCurrent();

Q_SIGNALS:
    void currentChanged();
    void answersChanged();
    /// \brief A new message is the first of the model.
    void arrived();

private:
    Message current() const { return isOpen() ? m_model.at(m_row) : Message(); }
    Message newest() const { return m_model.count() > 0 ? m_model.at(0) : Message(); }
    void retranslate();

    MessageModel m_model;
    int m_row = -1; ///< of the message that is read
};
