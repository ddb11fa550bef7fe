// SPDX-License-Identifier: MIT
#include <HmiCore/HmiActivationOverride>
#include <HmiCore/HmiActivationOverrideManager>
#include <HmiCore/hmicore.h>

#include <QMetaMethod>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QTest>

#include <climits>
#include <memory>

using namespace HmiCore;

namespace {

/// Answers what it is told to, and notes what it was asked.
class FakeOverride : public HmiActivationOverride
{
public:
    explicit FakeOverride(int priority, const QString& answer = QString(), bool takesOver = false)
        : answer(answer)
        , takesOver(takesOver)
        , m_priority(priority)
    {
    }

    int priority() const override { return m_priority; }
    bool handleOverride(int domain) override
    {
        asked.append(domain);
        return takesOver;
    }
    QString handleNameOverride(int domain) const override
    {
        return answer.isEmpty() ? answer : answer + QString::number(domain);
    }
    QString handleIconOverride(int domain, const QString& postfix) const override
    {
        return answer.isEmpty() ? answer : answer + QString::number(domain) + postfix;
    }

    using HmiActivationOverride::activateIconOverride;
    using HmiActivationOverride::activateNameOverride;
    using HmiActivationOverride::addOverrideDomain;
    using HmiActivationOverride::deactivateIconOverride;
    using HmiActivationOverride::deactivateNameOverride;
    using HmiActivationOverride::overrideDomains;

    QString answer;
    bool takesOver;
    QList<int> asked;

private:
    const int m_priority;
};

/// As a module would write the least possible.
class PlainOverride : public HmiActivationOverride
{
public:
    bool handleOverride(int) override { return false; }
};

QString text(const char* latin1)
{
    return QString::fromLatin1(latin1);
}

HmiActivationOverrideManager* manager()
{
    return HmiActivationOverrideManager::instance();
}

} // namespace

/// The manager is one for all tests: each uses domains of its own.
class HmiActivationOverrideTest : public QObject
{
    Q_OBJECT

    static QStringList methods(const QMetaObject& type)
    {
        QStringList found;
        for (int i = type.methodOffset(); i < type.methodCount(); ++i) {
            const QMetaMethod method = type.method(i);
            const QList<QByteArray> names = method.parameterNames();
            found.append(QString::fromLatin1(method.methodSignature() + ' ' + names.join(',')));
        }
        return found;
    }

private Q_SLOTS:
    void thePublishedSignatures()
    {
        const QStringList ofOverride = methods(HmiActivationOverride::staticMetaObject);
        for (const char* const expected :
             {"nameOverrideChanged(int,bool,HmiCore::HmiActivationOverride*) domain,active,overide",
              "iconOverrideChanged(int,bool,HmiCore::HmiActivationOverride*) domain,active,overide",
              "activateNameOverride(int) domain", "activateIconOverride(int) domain",
              "deactivateNameOverride(int) domain", "deactivateIconOverride(int) domain",
              "addOverrideDomain(int) domain", "overrideDomains() "})
            QVERIFY2(ofOverride.contains(text(expected)), qPrintable(ofOverride.join(QLatin1Char('\n'))));
        const QStringList ofManager = methods(HmiActivationOverrideManager::staticMetaObject);
        for (const char* const expected :
             {"nameOverridesChanged() ", "iconOverridesChanged() ", "nameOverride(int) domain",
              "iconOverride(int,QString) domain,postfix",
              "onNameOverrideChanged(int,bool,HmiCore::HmiActivationOverride*) domain,active,overide",
              "onIconOverrideChanged(int,bool,HmiCore::HmiActivationOverride*) domain,active,overide"})
            QVERIFY2(ofManager.contains(text(expected)), qPrintable(ofManager.join(QLatin1Char('\n'))));
        QCOMPARE(ofManager.filter(text("override(")).size(), 0); // not for QML
    }

    void theBaseOverridesNothing()
    {
        const PlainOverride plain;
        QCOMPARE(plain.priority(), -1);
        QCOMPARE(plain.handleNameOverride(1), QString());
        QCOMPARE(plain.handleIconOverride(1, text("small")), QString());
    }

    void domainsCountOnce()
    {
        FakeOverride fake(0);
        fake.addOverrideDomain(3);
        fake.addOverrideDomain(1);
        fake.addOverrideDomain(3);
        QCOMPARE(fake.overrideDomains(), (QList<int>{3, 1}));
    }

    void activationIsToldOnce()
    {
        FakeOverride fake(0);
        QSignalSpy names(&fake, &HmiActivationOverride::nameOverrideChanged);
        QSignalSpy icons(&fake, &HmiActivationOverride::iconOverrideChanged);
        fake.deactivateNameOverride(7);
        fake.deactivateIconOverride(7);
        QCOMPARE(names.size() + icons.size(), 0);
        fake.activateNameOverride(7);
        fake.activateNameOverride(7);
        QCOMPARE(names.size(), 1);
        QCOMPARE(names.at(0).mid(0, 2), (QVariantList{7, true}));
        QCOMPARE(names.at(0).at(2).value<HmiActivationOverride*>(), &fake);
        fake.deactivateNameOverride(7);
        fake.deactivateNameOverride(7);
        QCOMPARE(names.size(), 2);
        QCOMPARE(names.at(1).mid(0, 2), (QVariantList{7, false}));
        QCOMPARE(icons.size(), 0);
        fake.activateIconOverride(7);
        fake.deactivateIconOverride(7);
        QCOMPARE(icons.size(), 2);
        QCOMPARE(names.size(), 2);
    }

    void syncTellsInTheOrderOfActivation()
    {
        FakeOverride fake(0);
        for (const int domain : {5, 2, 9})
            fake.activateNameOverride(domain);
        fake.activateIconOverride(4);
        QSignalSpy names(&fake, &HmiActivationOverride::nameOverrideChanged);
        QSignalSpy icons(&fake, &HmiActivationOverride::iconOverrideChanged);
        fake.syncNameOverrides();
        QList<int> domains;
        for (const QVariantList& change : names)
            domains.append(change.at(0).toInt());
        QCOMPARE(domains, (QList<int>{5, 2, 9}));
        QCOMPARE(icons.size(), 0);
        fake.activateIconOverride(4); // it is active already
        QCOMPARE(icons.size(), 0);
        fake.syncIconOverrides();
        QCOMPARE(icons.size(), 1);
    }

    void theHighestPriorityNamesFirst()
    {
        FakeOverride low(5, text("low"));
        FakeOverride high(10, text("high"));
        manager()->registerOverride(&low);
        manager()->registerOverride(&high);
        low.activateNameOverride(100);
        high.activateNameOverride(100);
        low.activateIconOverride(100);
        high.activateIconOverride(100);
        QCOMPARE(manager()->nameOverride(100), text("high100"));
        QCOMPARE(manager()->iconOverride(100, text("_s")), text("high100_s"));
        high.answer.clear();
        QCOMPARE(manager()->nameOverride(100), text("low100"));
        QCOMPARE(manager()->iconOverride(100, QString()), text("low100"));
        low.answer.clear();
        QCOMPARE(manager()->nameOverride(100), QString());
        QCOMPARE(manager()->nameOverride(101), QString());
        QCOMPARE(manager()->iconOverride(101, text("_s")), QString());
    }

    void prioritiesAreSigned()
    {
        FakeOverride lowest(INT_MIN, text("lowest"));
        FakeOverride none(-1, text("none"));
        FakeOverride zero(0, text("zero"));
        FakeOverride highest(INT_MAX, text("highest"));
        for (FakeOverride* const fake : {&lowest, &zero, &highest, &none}) {
            manager()->registerOverride(fake);
            fake->activateNameOverride(110);
        }
        for (FakeOverride* const fake : {&highest, &zero, &none, &lowest}) {
            QCOMPARE(manager()->nameOverride(110), fake->answer + text("110"));
            fake->answer.clear();
        }
    }

    void theListsOfDomainsFollow()
    {
        FakeOverride a(1, text("a"));
        FakeOverride b(2, text("b"));
        manager()->registerOverride(&a);
        manager()->registerOverride(&b);
        const QList<int> before = manager()->nameOverrides();
        QSignalSpy names(manager(), &HmiActivationOverrideManager::nameOverridesChanged);
        QSignalSpy icons(manager(), &HmiActivationOverrideManager::iconOverridesChanged);
        a.activateNameOverride(121);
        b.activateNameOverride(120);
        b.activateNameOverride(121);
        QCOMPARE(names.size(), 3);
        QCOMPARE(manager()->nameOverrides(), before + QList<int>({120, 121}));
        a.deactivateNameOverride(121);
        QCOMPARE(names.size(), 4);
        QCOMPARE(manager()->nameOverride(121), text("b121"));
        b.deactivateNameOverride(121);
        b.deactivateNameOverride(120);
        QCOMPARE(names.size(), 6);
        QCOMPARE(manager()->nameOverrides(), before);
        QCOMPARE(icons.size(), 0);
        a.activateIconOverride(120);
        QCOMPARE(manager()->iconOverrides().count(120), 1);
        a.deactivateIconOverride(120);
        QCOMPARE(icons.size(), 2);
        QCOMPARE(manager()->iconOverrides().count(120), 0);
    }

    /// Whoever tells of a deactivation without an activation is heard while the domain has others.
    void aDeactivationOfSomebodyElse()
    {
        FakeOverride active(1, text("a"));
        FakeOverride other(2);
        manager()->registerOverride(&active);
        manager()->registerOverride(&other);
        active.activateNameOverride(130);
        QSignalSpy names(manager(), &HmiActivationOverrideManager::nameOverridesChanged);
        Q_EMIT other.nameOverrideChanged(130, false, &other);
        QCOMPARE(names.size(), 1);
        QCOMPARE(manager()->nameOverride(130), text("a130"));
        Q_EMIT other.nameOverrideChanged(131, false, &other);
        QCOMPARE(names.size(), 1);
    }

    void whatWasActiveBeforeTheRegistrationCounts()
    {
        FakeOverride fake(1, text("early"));
        fake.activateNameOverride(140);
        fake.activateIconOverride(141);
        QVERIFY(!manager()->nameOverrides().contains(140));
        manager()->registerOverride(&fake);
        QCOMPARE(manager()->nameOverride(140), text("early140"));
        QCOMPARE(manager()->iconOverride(141, QString()), text("early141"));
        fake.deactivateNameOverride(140);
        QVERIFY(!manager()->nameOverrides().contains(140));
    }

    void registeredTwiceItIsListedTwice()
    {
        FakeOverride fake(1);
        fake.addOverrideDomain(150);
        fake.activateNameOverride(150);
        manager()->registerOverride(&fake);
        manager()->registerOverride(&fake);
        QVERIFY(!manager()->override(150));
        QCOMPARE(fake.asked, (QList<int>{150, 150}));
        fake.deactivateNameOverride(150); // every occurrence goes
        QVERIFY(!manager()->nameOverrides().contains(150));
    }

    void aClaimEndsTheSearch()
    {
        FakeOverride first(30, QString(), false);
        FakeOverride second(20, QString(), true);
        FakeOverride third(10, QString(), true);
        for (FakeOverride* const fake : {&third, &first, &second}) {
            fake->addOverrideDomain(160);
            manager()->registerOverride(fake);
        }
        QVERIFY(manager()->override(160));
        QCOMPARE(first.asked, QList<int>{160});
        QCOMPARE(second.asked, QList<int>{160});
        QCOMPARE(third.asked, QList<int>());
        QVERIFY(!manager()->override(161));
    }

    void aNameDoesNotClaimAndAClaimDoesNotName()
    {
        FakeOverride fake(1, text("n"), true);
        fake.addOverrideDomain(170);
        manager()->registerOverride(&fake);
        fake.activateNameOverride(171);
        QVERIFY(!manager()->override(171));
        QCOMPARE(manager()->nameOverride(170), QString());
    }

    void nobodyMindsTheDead()
    {
        FakeOverride low(1, text("low"), true);
        auto high = std::make_unique<FakeOverride>(9, text("high"), true);
        auto middle = std::make_unique<FakeOverride>(5, text("middle"), true);
        for (FakeOverride* const fake : {&low, high.get(), middle.get()}) {
            fake->addOverrideDomain(180);
            fake->activateNameOverride(180);
            manager()->registerOverride(fake);
        }
        high.reset();
        QCOMPARE(manager()->nameOverride(180), text("middle180"));
        FakeOverride late(7, text("late"), true); // sorted among the dead
        late.addOverrideDomain(180);
        late.activateNameOverride(180);
        manager()->registerOverride(&late);
        QCOMPARE(manager()->nameOverride(180), text("late180"));
        middle.reset();
        QVERIFY(manager()->override(180));
        QCOMPARE(late.asked, QList<int>{180});
        late.answer.clear();
        QCOMPARE(manager()->nameOverride(180), text("low180"));
        low.deactivateNameOverride(180);
        late.deactivateNameOverride(180);
        QVERIFY(manager()->nameOverrides().contains(180)); // the dead ones are still listed
        QCOMPARE(manager()->nameOverride(180), QString());
    }

    void nullIsIgnored() { manager()->registerOverride(nullptr); }

    /// One that is asked may bring others or make an end of itself.
    void theListMayChangeWhileItIsAsked()
    {
        class Changing : public FakeOverride
        {
        public:
            using FakeOverride::FakeOverride;
            bool handleOverride(int domain) override
            {
                if (!brought) {
                    brought = std::make_unique<FakeOverride>(100, QString(), true);
                    brought->addOverrideDomain(domain);
                    HmiActivationOverrideManager::instance()->registerOverride(brought.get());
                    victim.reset();
                }
                return false;
            }
            std::unique_ptr<FakeOverride> brought;
            std::unique_ptr<FakeOverride> victim;
        };
        Changing changing(50);
        changing.victim = std::make_unique<FakeOverride>(10, QString(), true);
        for (FakeOverride* const fake : {static_cast<FakeOverride*>(&changing), changing.victim.get()}) {
            fake->addOverrideDomain(190);
            manager()->registerOverride(fake);
        }
        QVERIFY(!manager()->override(190));
        QVERIFY(manager()->override(190)); // by the one that was brought
    }

    void qmlReadsTheCombination()
    {
        registerTypes();
        FakeOverride fake(1, text("name"));
        manager()->registerOverride(&fake);
        QQmlEngine engine;
        QQmlComponent component(&engine);
        component.setData(R"(import QtQml 2.15
            import HmiOverrides 1.0
            QtObject {
                property bool named: HmiOverrides.nameOverrides.indexOf(200) >= 0
                property string name: named ? HmiOverrides.nameOverride(200) : "own"
                property string icon: HmiOverrides.iconOverrides.indexOf(200) >= 0 ? HmiOverrides.iconOverride(200, "_big") : ""
            })",
                          QUrl());
        const std::unique_ptr<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        QCOMPARE(object->property("name").toString(), text("own"));
        fake.activateNameOverride(200);
        QCOMPARE(object->property("name").toString(), text("name200"));
        fake.activateIconOverride(200);
        QCOMPARE(object->property("icon").toString(), text("name200_big"));
        fake.deactivateNameOverride(200);
        QCOMPARE(object->property("name").toString(), text("own"));
    }
};

QTEST_GUILESS_MAIN(HmiActivationOverrideTest)
#include "tst_hmiactivationoverride.moc"
