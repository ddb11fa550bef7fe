// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "messagecenter.h"

#include <AL2HMIBridge/BridgeTester>

#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <optional>

using AL2HMIBridge::BridgeTester;

/// What happens to messages between their arrival and their end.
class MessageCenterTest : public QObject
{
    Q_OBJECT

    static Message text(const char* sender, const QString& content = QStringLiteral("Hello"))
    {
        Message message;
        message.sender = QString::fromUtf8(sender);
        message.text = content;
        return message;
    }

    QStringList senders()
    {
        QStringList list;
        for (int row = 0; row < m_center->model()->count(); ++row)
            list.append(m_center->model()->index(row).data(MessageModel::Sender).toString());
        return list;
    }

    std::optional<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;
    std::unique_ptr<MessageCenter> m_center;

private Q_SLOTS:
    void init()
    {
        m_log.emplace();
        m_vehicle = std::make_unique<BridgeTester>();
        m_center = std::make_unique<MessageCenter>(nullptr);
    }

    void cleanup()
    {
        m_center.reset();
        m_vehicle.reset();
        m_log.reset();
    }

    void theNewestComesFirstWithItsTime()
    {
        QVERIFY(BridgeTester::setState("GlobalSource", {{"clockText", QStringLiteral("10:00")}}));
        m_center->add(text("Ada"));
        QVERIFY(BridgeTester::setState("GlobalSource", {{"clockText", QStringLiteral("10:05")}}));
        m_center->add(text("Ben"));
        QCOMPARE(senders(), QStringList({QStringLiteral("Ben"), QStringLiteral("Ada")}));
        QCOMPARE(m_center->model()->index(0).data(MessageModel::Time).toString(), QStringLiteral("10:05"));
        QCOMPARE(m_center->model()->index(1).data(MessageModel::Time).toString(), QStringLiteral("10:00"));
        QCOMPARE(m_center->newestSender(), QStringLiteral("Ben"));
    }

    void whatIsOpenedIsRead()
    {
        m_center->add(text("Ada"));
        m_center->add(text("Ben"));
        QCOMPARE(m_center->model()->unreadCount(), 2);
        QSignalSpy counts(m_center->model(), &MessageModel::unreadCountChanged);
        QVERIFY(m_center->open(1));
        QCOMPARE(m_center->sender(), QStringLiteral("Ada"));
        QCOMPARE(m_center->model()->unreadCount(), 1);
        QVERIFY(!counts.isEmpty());
        QVERIFY(!m_center->open(-1) && !m_center->open(2));
        QCOMPARE(m_center->sender(), QStringLiteral("Ada"));
    }

    void whoReadsGoesOnReadingWhenAnotherComes()
    {
        m_center->add(text("Ada"));
        QVERIFY(m_center->open(0));
        m_center->add(text("Ben"));
        QCOMPARE(m_center->sender(), QStringLiteral("Ada"));
        m_center->removeCurrent();
        QVERIFY(!m_center->isOpen());
        QCOMPARE(senders(), QStringList{QStringLiteral("Ben")});
        m_center->removeCurrent();
        QCOMPARE(m_center->model()->count(), 1);
    }

    void textsAreAnsweredOnce()
    {
        m_center->add(text("Ada"));
        m_center->sendAnswer(0); // none is open
        QVERIFY(m_center->open(0));
        QVERIFY(m_center->isAnswerable());
        m_center->sendAnswer(-1);
        m_center->sendAnswer(m_center->answers().size());
        QCOMPARE(m_center->answer(), QString());
        m_center->sendAnswer(1);
        QCOMPARE(m_center->answer(), m_center->answers().at(1));
        QVERIFY(!m_center->isAnswerable());
        m_center->sendAnswer(2);
        QCOMPARE(m_center->answer(), m_center->answers().at(1));
    }

    void noticesAreNotAnswered()
    {
        Message cold;
        cold.kind = Message::IcyRoad;
        m_center->add(cold);
        QVERIFY(m_center->open(0));
        QVERIFY(!m_center->isAnswerable());
        QCOMPARE(m_center->sender(), QStringLiteral("Vehicle"));
        QVERIFY(!m_center->text().isEmpty());
    }

    void theLastHundredAreKept()
    {
        m_center->add(text("first"));
        QVERIFY(m_center->open(0));
        for (int i = 1; i < MessageModel::most; ++i)
            m_center->add(text("next"));
        QCOMPARE(m_center->model()->count(), MessageModel::most);
        QCOMPARE(m_center->sender(), QStringLiteral("first"));
        m_center->add(text("last"));
        QCOMPARE(m_center->model()->count(), MessageModel::most);
        QVERIFY(!m_center->isOpen()); // it is gone
        QCOMPARE(senders().constFirst(), QStringLiteral("last"));
    }

    void longTextsAreCutAndListsShowTheirFirstLine()
    {
        m_center->add(text("Ada", QString(100000, QLatin1Char('x'))));
        m_center->add(text("Ben", QStringLiteral("One\nTwo")));
        QCOMPARE(m_center->model()->at(1).text.size(), MessageModel::longestText);
        QCOMPARE(m_center->model()->index(0).data(MessageModel::Text).toString(), QStringLiteral("One"));
    }

    void whoHasNoNameIsShownByTheNumber()
    {
        Message message = text("");
        message.number = QStringLiteral("+1 555 0100");
        m_center->add(message);
        m_center->add(text(""));
        QCOMPARE(senders(), QStringList({QStringLiteral("Unknown sender"), QStringLiteral("+1 555 0100")}));
    }
};

QTEST_GUILESS_MAIN(MessageCenterTest)
#include "tst_messagecenter.moc"
