// SPDX-License-Identifier: MIT
#include <HmiGuiFramework/DataStore>

#include <QTest>
#include <QTimer>

using HmiGuiFramework::DataStore;

class DataStoreTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void givesBackWhatWasStored()
    {
        QTimer timer;
        DataStore::store(&timer, QStringLiteral("Timer"));
        QCOMPARE(DataStore::get<QTimer>(QStringLiteral("Timer")), &timer);
        QCOMPARE(DataStore::get<QObject>(QStringLiteral("Timer")), &timer);
    }

    void isNullWhenAbsentOrOfAnotherType()
    {
        QTimer timer;
        DataStore::store(&timer, QStringLiteral("Timer"));
        QCOMPARE(DataStore::get<QTimer>(QStringLiteral("Nothing")), nullptr);
        QCOMPARE(DataStore::get<DataStoreTest>(QStringLiteral("Timer")), nullptr);
    }

    void aLaterObjectReplacesAnEarlierOneAndNullRemovesIt()
    {
        QObject first;
        QObject second;
        DataStore::store(&first, QStringLiteral("Object"));
        DataStore::store(&second, QStringLiteral("Object"));
        QCOMPARE(DataStore::get<QObject>(QStringLiteral("Object")), &second);
        DataStore::store(nullptr, QStringLiteral("Object"));
        QCOMPARE(DataStore::get<QObject>(QStringLiteral("Object")), nullptr);
    }

    void aDeletedObjectIsAbsent()
    {
        auto* const object = new QObject;
        DataStore::store(object, QStringLiteral("Object"));
        delete object;
        QCOMPARE(DataStore::get<QObject>(QStringLiteral("Object")), nullptr);
    }
};

QTEST_GUILESS_MAIN(DataStoreTest)
#include "tst_datastore.moc"
