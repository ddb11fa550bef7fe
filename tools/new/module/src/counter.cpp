// SPDX-License-Identifier: MIT
#include "counter.h"

Counter::Counter(QObject* parent)
    : QObject(parent)
{
}

void Counter::increase()
{
    ++m_value;
    Q_EMIT valueChanged(m_value);
}
