// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QVector>

#include <functional>

/// \brief Lets hard keys that the core has no rules for do something in a module. GUI thread only.
///
/// A key acts when it goes down, and again with each of its steps. While the head unit is switched off or in valet mode it
/// does nothing.
class HardKeys : public QObject
{
public:
    struct Entry
    {
        int key;
        std::function<void()> act;
    };

    HardKeys(const QVector<Entry>& entries, QObject* parent);

private:
    void handle(int key, int state) const;

    const QVector<Entry> m_entries;
};
