// SPDX-License-Identifier: MIT
#include "logcapture.h"
#include "sourcetable.h"

#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>

#include <QMetaMethod>
#include <QMetaProperty>
#include <QSignalSpy>
#include <QTest>

#include <memory>

using namespace AL2HMIBridge;

/// Every source against the table from which it is made.
class SourcesTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_tester;
    QList<TableSource> m_table;

    static QString nameOf(const QJsonValue& item) { return item.toObject().value(QStringLiteral("name")).toString(); }

    static QJsonValue valueOf(QObject* source, const QString& property)
    {
        const QVariant value = source->property(property.toLatin1().constData());
        if (value.userType() == qMetaTypeId<QList<int>>()) {
            QJsonArray numbers;
            const auto list = value.value<QList<int>>();
            for (const int number : list)
                numbers.append(number);
            return numbers;
        }
        const bool isPlain = value.userType() < QMetaType::User;
        return isPlain ? QJsonValue::fromVariant(value) : QJsonValue(value.toInt());
    }

    void sourceRows() const
    {
        QTest::addColumn<int>("row");
        for (int i = 0; i < m_table.size(); ++i)
            QTest::newRow(qPrintable(m_table.at(i).name)) << i;
    }

    void stateRows() const
    {
        QTest::addColumn<int>("row");
        QTest::addColumn<QJsonObject>("field");
        for (int i = 0; i < m_table.size(); ++i)
            for (const QJsonValue field : m_table.at(i).state)
                QTest::newRow(qPrintable(m_table.at(i).name + QLatin1Char('.') + nameOf(field)))
                    << i << field.toObject();
    }

    static QMetaMethod findMethod(const QObject* source, const QString& name)
    {
        const QMetaObject* const meta = source->metaObject();
        for (int i = 0; i < meta->methodCount(); ++i)
            if (QString::fromLatin1(meta->method(i).name()) == name)
                return meta->method(i);
        return QMetaMethod();
    }

private Q_SLOTS:
    void initTestCase()
    {
        m_table = readSourceTable();
        QCOMPARE(m_table.size(), 15);
    }

    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_tester = std::make_unique<BridgeTester>();
    }

    void cleanup()
    {
        m_tester.reset();
        m_log.reset();
    }

    void everySourceHasItsClass_data() { sourceRows(); }

    void everySourceHasItsClass()
    {
        QFETCH(int, row);
        QObject* const source = m_table.at(row).instance();
        QVERIFY(source);
        QCOMPARE(QString::fromLatin1(source->metaObject()->className()),
                 QStringLiteral("AL2HMIBridge::") + m_table.at(row).name);
        QCOMPARE(source, m_table.at(row).instance());
        QCOMPARE(source->parent(), QCoreApplication::instance());
    }

    void everyStateHasItsDefaultTakesItsValueAndFallsBack_data() { stateRows(); }

    void everyStateHasItsDefaultTakesItsValueAndFallsBack()
    {
        QFETCH(int, row);
        QFETCH(QJsonObject, field);
        const TableSource& source = m_table.at(row);
        QObject* const object = source.instance();
        const QString name = field.value(QStringLiteral("name")).toString();
        QCOMPARE(valueOf(object, name), source.initial(field));
        for (int salt = 0; salt < 2; ++salt) {
            const QJsonValue sample = source.sample(field, salt);
            const bool differs = sample != valueOf(object, name);
            const QMetaObject* const meta = object->metaObject();
            QSignalSpy changed(object,
                               meta->property(meta->indexOfProperty(name.toLatin1().constData())).notifySignal());
            QVERIFY(changed.isValid());
            QVERIFY(BridgeTester::setState(source.name, {{name, sample.toVariant()}}));
            QCOMPARE(valueOf(object, name), sample);
            QCOMPARE(changed.size(), differs ? 1 : 0);
            QVERIFY(BridgeTester::setState(source.name, {{name, sample.toVariant()}}));
            QCOMPARE(changed.size(), differs ? 1 : 0);
        }
        BridgeTester::resetState();
        QCOMPARE(valueOf(object, name), source.initial(field));
    }

    void everyStateRefusesAnotherType_data() { stateRows(); }

    void everyStateRefusesAnotherType()
    {
        QFETCH(int, row);
        QFETCH(QJsonObject, field);
        const TableSource& source = m_table.at(row);
        const QString name = field.value(QStringLiteral("name")).toString();
        const bool isText = field.value(QStringLiteral("type")).toString() == QLatin1String("text");
        const QVariantList wrong{isText ? QVariant(1) : QVariant(QStringLiteral("1")), QVariant(), QVariantMap()};
        for (const QVariant& value : wrong) {
            QVERIFY(!BridgeTester::setState(source.name, {{name, value}}));
            const QStringList warnings = m_log->take(QStringLiteral("al2hmi.bridge"), QtWarningMsg);
            QCOMPARE(warnings.size(), 1);
            QVERIFY2(warnings.constFirst().startsWith(
                         QStringLiteral("Line refused on messages: %1.%2: ").arg(source.name, name)),
                     qPrintable(warnings.constFirst()));
        }
        QCOMPARE(valueOf(source.instance(), name), source.initial(field));
    }

    void everyPropertyIsInTheTable_data() { sourceRows(); }

    void everyPropertyIsInTheTable()
    {
        QFETCH(int, row);
        QStringList listed{QStringLiteral("objectName")};
        for (const QJsonValue field : m_table.at(row).state)
            listed.append(nameOf(field));
        QStringList found;
        const QMetaObject* const meta = m_table.at(row).instance()->metaObject();
        for (int i = 0; i < meta->propertyCount(); ++i)
            found.append(QString::fromLatin1(meta->property(i).name()));
        QCOMPARE(found, listed);
    }

    void everyCallLeavesWithItsArgumentsInOrder_data()
    {
        QTest::addColumn<int>("row");
        QTest::addColumn<QJsonObject>("call");
        for (int i = 0; i < m_table.size(); ++i)
            for (const QJsonValue call : m_table.at(i).calls)
                QTest::newRow(qPrintable(m_table.at(i).name + QLatin1Char('.') + nameOf(call))) << i << call.toObject();
    }

    void everyCallLeavesWithItsArgumentsInOrder()
    {
        QFETCH(int, row);
        QFETCH(QJsonObject, call);
        const TableSource& source = m_table.at(row);
        const QString name = call.value(QStringLiteral("name")).toString();
        const QMetaMethod method = findMethod(source.instance(), name);
        QVERIFY(method.isValid());
        const QJsonArray arguments = call.value(QStringLiteral("args")).toArray();
        QCOMPARE(method.parameterCount(), int(arguments.size()));

        QVariantList expected;
        for (int i = 0; i < arguments.size(); ++i) {
            const QVariant value = source.sample(arguments.at(i).toObject(), i % 2).toVariant();
            expected.append(value.userType() == QMetaType::Double || value.userType() == QMetaType::LongLong
                                ? QVariant(value.toInt())
                                : value);
            QCOMPARE(QString::fromLatin1(method.parameterNames().at(i)), nameOf(arguments.at(i)));
        }
        QVERIFY(expected.size() <= 3);
        void* parameters[4] = {nullptr, nullptr, nullptr, nullptr}; // an enumeration is as large as an int
        for (int i = 0; i < expected.size(); ++i)
            parameters[i + 1] = expected[i].data();
        source.instance()->qt_metacall(QMetaObject::InvokeMetaMethod, method.methodIndex(), parameters);

        const auto calls = BridgeTester::calls();
        QCOMPARE(calls.size(), 1);
        QCOMPARE(calls.constFirst().source, source.name);
        QCOMPARE(calls.constFirst().name, name);
        QCOMPARE(calls.constFirst().arguments, expected);
    }

    void eventsArriveWithTheirArguments()
    {
        QSignalSpy keys(KeySource::instance(), &KeySource::keyEvent);
        QSignalSpy combinations(KeySource::instance(), &KeySource::keyComboEvent);
        QVERIFY(BridgeTester::sendEvent("KeySource", "keyEvent", {7, 0}));
        QVERIFY(BridgeTester::sendEvent("KeySource", "keyComboEvent", {7, 5}));
        QCOMPARE(keys.size(), 1);
        QCOMPARE(keys.takeFirst(), QVariantList({7, 0}));
        QCOMPARE(combinations.takeFirst(), QVariantList({7, 5}));
    }

    void allMembersAreStoredBeforeAnybodyIsTold()
    {
        FMTunerSource* const fm = FMTunerSource::instance();
        QStringList seen;
        const auto look = [&] { seen.append(fm->frequency() + QLatin1Char(' ') + fm->stationName()); };
        QObject context;
        connect(fm, &FMTunerSource::frequencyChanged, &context, look);
        connect(fm, &FMTunerSource::stationNameChanged, &context, look);
        QVERIFY(BridgeTester::setState(
            "FMTunerSource", {{"stationName", QStringLiteral("North")}, {"frequency", QStringLiteral("98.5")}}));
        QCOMPARE(seen, QStringList({QStringLiteral("98.5 North"), QStringLiteral("98.5 North")}));
    }

    void oneWrongFieldRefusesTheWholeMessage()
    {
        QVERIFY(!BridgeTester::setState("GlobalSource", {{"destinationCountry", 5}, {"muted", true}, {"volume", 41}}));
        QVERIFY(m_log->takeOne(QtWarningMsg,
                               QStringLiteral("Line refused on messages: GlobalSource.volume: 41 is out of range")));
        QCOMPARE(GlobalSource::instance()->destinationCountry(), 0);
        QCOMPARE(GlobalSource::instance()->muted(), false);
    }

    void tunersKeepTheirStateApart()
    {
        QVERIFY(BridgeTester::setState("FMTunerSource", {{"frequency", QStringLiteral("98.5")}}));
        for (const TableSource& source : std::as_const(m_table))
            if (source.name.endsWith(QStringLiteral("TunerSource")) && source.name != QLatin1String("FMTunerSource"))
                QCOMPARE(source.instance()->property("frequency").toString(), QString());
    }
};

QTEST_GUILESS_MAIN(SourcesTest)
#include "tst_sources.moc"
