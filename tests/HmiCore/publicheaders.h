// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QString>

/// Registers that the source which includes one header alone was compiled and linked.
struct PublicHeader
{
    explicit PublicHeader(const char* name) { registered().append(QString::fromLatin1(name)); }

    static QStringList& registered();
};
