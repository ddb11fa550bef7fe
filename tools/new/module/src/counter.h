// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

/// \brief What the screen shows; put your own in its place.
class Counter : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int value READ value NOTIFY valueChanged)

public:
    explicit Counter(QObject* parent = nullptr);

    int value() const { return m_value; } ///< 0 at first

public Q_SLOTS:
    void increase();

Q_SIGNALS:
    void valueChanged(int value);

private:
    int m_value = 0;
};
