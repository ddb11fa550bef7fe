// SPDX-License-Identifier: MIT
#include "messagecenter.h"

#include <AL2HMIBridge/GlobalSource>
#include <HmiCore/HmiManager>

#include <iterator>

namespace {

const char* const cannedAnswers[] = {
    QT_TRANSLATE_NOOP("MessageCenter", "I am driving, call you later."),
    QT_TRANSLATE_NOOP("MessageCenter", "I am on my way."),
    QT_TRANSLATE_NOOP("MessageCenter", "All right."),
    QT_TRANSLATE_NOOP("MessageCenter", "No, sorry."),
};

} // namespace

MessageCenter::MessageCenter(QObject* parent)
    : QObject(parent)
    , m_model(this)
{
    connect(HmiCore::HmiManager::instance(), &HmiCore::HmiManager::hmiRetranslated, this, &MessageCenter::retranslate);
}

void MessageCenter::retranslate()
{
    m_model.retranslate();
    Q_EMIT currentChanged();
    Q_EMIT answersChanged();
}

void MessageCenter::add(Message message)
{
    message.time = AL2HMIBridge::GlobalSource::instance()->clockText();
    const bool dropsCurrent = m_model.count() == MessageModel::most && m_row == MessageModel::most - 1;
    if (isOpen())
        m_row = dropsCurrent ? -1 : m_row + 1;
    m_model.add(message);
    Q_EMIT currentChanged();
    Q_EMIT arrived();
}

bool MessageCenter::isAnswerable() const
{
    return isOpen() && current().kind == Message::Text && current().answer < 0;
}

QString MessageCenter::answer() const
{
    const int row = current().answer;
    return row < 0 ? QString() : tr(cannedAnswers[row]);
}

QStringList MessageCenter::answers() const
{
    QStringList list;
    for (const char* const text : cannedAnswers)
        list.append(tr(text));
    return list;
}

bool MessageCenter::open(int row)
{
    if (row < 0 || row >= m_model.count())
        return false;
    m_row = row;
    Message message = current();
    message.unread = false;
    m_model.replace(row, message);
    Q_EMIT currentChanged();
    return true;
}

void MessageCenter::sendAnswer(int answer)
{
    if (!isAnswerable() || answer < 0 || answer >= int(std::size(cannedAnswers)))
        return;
    Message message = current();
    message.answer = answer;
    m_model.replace(m_row, message);
    Q_EMIT currentChanged();
}

void MessageCenter::removeCurrent()
{
    if (!isOpen())
        return;
    const int row = m_row;
    m_row = -1;
    m_model.remove(row);
    Q_EMIT currentChanged();
}
