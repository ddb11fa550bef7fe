// SPDX-License-Identifier: MIT
#include "keyboard.h"
#include "logcapture.h"
#include "vehiclekeys.h"

#include <HmiVehicle/keycatalogue.h>
#include <HmiVehicle/vehiclecontrol.h>
#include <HmiVehicle/vehicledirectory.h>
#include <HmiVehicle/vehicleservice.h>

#include <QGuiApplication>
#include <QKeyEvent>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

/// An item into which text is typed.
class TextField : public QQuickItem
{
    Q_OBJECT

public:
    explicit TextField(QQuickItem* parent)
        : QQuickItem(parent)
    {
        setFlag(ItemAcceptsInputMethod);
    }

    QString typed;

protected:
    void keyPressEvent(QKeyEvent* event) override { typed += event->text(); }
};

class KeyboardTest : public QObject
{
    Q_OBJECT

    static void send(QWindow* window, QEvent::Type type, int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier,
                     bool repeats = false)
    {
        const QString text = key <= Qt::Key_AsciiTilde ? QString(QLatin1Char(char(key))).toLower() : QString();
        QKeyEvent event(type, key, modifiers, text, repeats);
        QCoreApplication::sendEvent(window, &event);
    }

    Keyboard::Target journal()
    {
        const auto note = [this](const char* what) {
            return
                [this, what](int key) { m_journal.append(QStringLiteral("%1 %2").arg(QLatin1String(what)).arg(key)); };
        };
        return {note("press"), note("release"),
                [this](int key, int steps) { m_journal.append(QStringLiteral("turn %1 by %2").arg(key).arg(steps)); }};
    }

    QStringList take() { return std::exchange(m_journal, {}); }

    static QStringList lines(std::initializer_list<const char*> texts)
    {
        QStringList list;
        for (const char* const text : texts)
            list.append(QString::fromLatin1(text));
        return list;
    }

    QStringList m_journal;
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<QQuickWindow> m_window;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_journal.clear();
        m_window = std::make_unique<QQuickWindow>();
        new Keyboard(m_window.get(), journal());
    }

    void cleanup()
    {
        m_window.reset();
        m_log.reset();
    }

    void everyHardKeyHasAKeyOfTheKeyboard()
    {
        for (int key = Qt::Key_Space; key <= Qt::Key_AsciiTilde; ++key)
            send(m_window.get(), QEvent::KeyPress, key);
        for (int key = Qt::Key_Escape; key <= Qt::Key_F35; ++key)
            send(m_window.get(), QEvent::KeyPress, key);
        const QStringList pressed = take();
        for (const auto& hardKey : HmiVehicle::KeyCatalogue::instance().keys())
            QVERIFY2(pressed.count(QStringLiteral("press %1").arg(hardKey.id)) == 1, qPrintable(hardKey.name));
        QVERIFY(pressed.contains(QStringLiteral("turn 54 by 1")) && pressed.contains(QStringLiteral("turn 55 by 1")));
        QCOMPARE(pressed.size(), int(HmiVehicle::KeyCatalogue::instance().keys().size()) + 2);
    }

    void aKeyIsDownForAsLongAsItIsHeld()
    {
        send(m_window.get(), QEvent::KeyPress, Qt::Key_Right);
        for (int i = 0; i < 3; ++i) {
            send(m_window.get(), QEvent::KeyRelease, Qt::Key_Right, Qt::NoModifier, true);
            send(m_window.get(), QEvent::KeyPress, Qt::Key_Right, Qt::NoModifier, true);
        }
        QCOMPARE(take(), lines({"press 7"}));
        send(m_window.get(), QEvent::KeyRelease, Qt::Key_Right);
        QCOMPARE(take(), lines({"release 7"}));
        send(m_window.get(), QEvent::KeyRelease, Qt::Key_Right);
        QCOMPARE(take(), QStringList());
    }

    void aDialGoesAStepWithEachPress()
    {
        send(m_window.get(), QEvent::KeyPress, Qt::Key_Minus);
        send(m_window.get(), QEvent::KeyPress, Qt::Key_Minus, Qt::NoModifier, true);
        send(m_window.get(), QEvent::KeyRelease, Qt::Key_Minus);
        send(m_window.get(), QEvent::KeyPress, Qt::Key_Minus, Qt::KeypadModifier);
        QCOMPARE(take(), lines({"turn 55 by 1", "turn 55 by 1"}));
    }

    void commandsAndUnknownKeysAreLeftAlone()
    {
        for (const auto modifier : {Qt::ControlModifier, Qt::AltModifier, Qt::MetaModifier})
            send(m_window.get(), QEvent::KeyPress, Qt::Key_M, modifier);
        send(m_window.get(), QEvent::KeyPress, Qt::Key_Z);
        QCOMPARE(take(), QStringList());
        send(m_window.get(), QEvent::KeyPress, Qt::Key_M, Qt::ShiftModifier);
        send(m_window.get(), QEvent::KeyRelease, Qt::Key_M, Qt::ControlModifier);
        QCOMPARE(take(), lines({"press 48", "release 48"}));
    }

    void aWindowThatIsLeftHoldsNothing()
    {
        send(m_window.get(), QEvent::KeyPress, Qt::Key_V);
        QFocusEvent left(QEvent::FocusOut);
        QCoreApplication::sendEvent(m_window.get(), &left);
        QCOMPARE(take(), lines({"press 10", "release 10"}));
        send(m_window.get(), QEvent::KeyRelease, Qt::Key_V);
        QCOMPARE(take(), QStringList());
        send(m_window.get(), QEvent::KeyPress, Qt::Key_V);
        take();
        m_window.reset();
        QCOMPARE(take(), lines({"release 10"}));
    }

    void aTextFieldHasPrecedence()
    {
        m_window->show();
        m_window->requestActivate();
        QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
        auto* const field = new TextField(m_window->contentItem());
        send(m_window.get(), QEvent::KeyPress, Qt::Key_M);
        field->forceActiveFocus();
        send(m_window.get(), QEvent::KeyPress, Qt::Key_T);
        send(m_window.get(), QEvent::KeyRelease, Qt::Key_M);
        QCOMPARE(take(), lines({"press 48", "release 48"}));
        QCOMPARE(field->typed, QStringLiteral("t"));
    }

    void theHelpNamesEveryKey()
    {
        const QString help = Keyboard::help();
        QVERIFY2(help.contains(QStringLiteral("Left   Seek down\n")), qPrintable(help));
        QVERIFY2(help.contains(QStringLiteral("J      Seek down (steering wheel)\n")), qPrintable(help));
        QVERIFY2(help.contains(QStringLiteral("+      Tune up, one step\n")), qPrintable(help));
        QCOMPARE(help.count(QLatin1Char('\n')), int(HmiVehicle::KeyCatalogue::instance().keys().size()) + 2);
    }

    void theKeysOfAVehicleInAnotherProcessArePressed()
    {
        using namespace HmiVehicle;
        const QTemporaryDir folder;
        Vehicle::Options options;
        options.frozen = true;
        VehicleService service(options);
        VehicleControl control(service);
        VehicleDirectory directory;
        connect(&directory, &VehicleDirectory::controlConnected, &control, &VehicleControl::addConnection);
        QStringList keys;
        connect(&service, &VehicleService::keySent, this,
                [&](int key, int state) { keys.append(QStringLiteral("%1:%2").arg(key).arg(state)); });
        QVERIFY(directory.listen(folder.path()));
        QQuickWindow window;
        new Keyboard(&window, keysOf(folder.path()));
        send(&window, QEvent::KeyPress, Qt::Key_L);
        QTRY_COMPARE(keys, QStringList{QStringLiteral("89:0")});
        service.vehicle().advance(1000);
        send(&window, QEvent::KeyRelease, Qt::Key_L);
        send(&window, QEvent::KeyPress, Qt::Key_Plus);
        QTRY_COMPARE(keys, QStringList({QStringLiteral("89:0"), QStringLiteral("89:3"), QStringLiteral("89:4"),
                                        QStringLiteral("54:0"), QStringLiteral("54:1"), QStringLiteral("54:2")}));
    }

    void aVehicleThatIsNotThereIsComplainedAboutOnce()
    {
        const QTemporaryDir folder;
        const Keyboard::Target keys = keysOf(folder.filePath(QStringLiteral("nothing")));
        keys.press(7);
        keys.release(7);
        keys.turn(54, 1);
        const QStringList warnings = m_log->take(QStringLiteral("default"), QtWarningMsg);
        QCOMPARE(warnings.size(), 1);
        QVERIFY2(warnings.at(0).startsWith(QStringLiteral("The keyboard does not reach the vehicle: ")),
                 qPrintable(warnings.at(0)));
    }
};

QTEST_MAIN(KeyboardTest)
#include "tst_keyboard.moc"
