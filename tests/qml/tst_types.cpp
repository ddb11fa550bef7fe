// SPDX-License-Identifier: MIT
#include "typesfixture.h"

#include <HmiCore/hmicore.h>

#include <QQmlContext>
#include <QQmlEngine>
#include <QtQuickTest>

#include <memory>

/// The types as the executable registers them, with folders of descriptions on the import path as a developer has them.
class Setup : public QObject
{
    Q_OBJECT

public Q_SLOTS:
    void qmlEngineAvailable(QQmlEngine* engine)
    {
        HmiCore::registerTypes();
        m_fixture = std::make_unique<TypesFixture>();
        engine->addImportPath(QStringLiteral(DESCRIPTIONS));
        engine->rootContext()->setContextProperty(QStringLiteral("fixture"), m_fixture.get());
    }

    void cleanupTestCase() { m_fixture.reset(); }

private:
    std::unique_ptr<TypesFixture> m_fixture;
};

QUICK_TEST_MAIN_WITH_SETUP(types, Setup)
#include "tst_types.moc"
