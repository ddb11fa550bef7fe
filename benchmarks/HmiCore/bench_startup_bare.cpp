// SPDX-License-Identifier: MIT
// The least that shows a QML screen.
#include "startclock.h"

#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>

int main(int argc, char** argv)
{
    QGuiApplication app(argc, argv);
    QQmlEngine engine;
    QQuickWindow window;
    window.resize(1280, 720);
    QQmlComponent component(&engine, QUrl::fromLocalFile(app.arguments().at(2)));
    auto* const item = qobject_cast<QQuickItem*>(component.create());
    if (!item)
        qFatal("%s", qPrintable(component.errorString()));
    item->setParentItem(window.contentItem());
    item->setSize(QSizeF(window.size()));
    const long long start = app.arguments().at(1).toLongLong();
    QObject::connect(
        &window, &QQuickWindow::frameSwapped, &window, [start] { StartClock::report(start); }, Qt::DirectConnection);
    window.show();
    return app.exec();
}
