// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QStringList>

/// \brief A way to put texts together from what a person does, with candidates to choose from. GUI thread only.
class TextComposer : public QObject
{
    Q_OBJECT

public:
    using QObject::QObject;

    QStringList candidates() const { return m_candidates; }
    QString preliminary() const { return m_preliminary; } ///< what is begun, as the field shows it

    virtual void select(int candidate) = 0; ///< other numbers than those of candidates() are ignored
    /// \brief Takes back the last piece of what is begun. False when nothing is.
    virtual bool takeBack() = 0;
    virtual void finish() = 0; ///< commits what is begun, as well as can be
    virtual void drop() = 0;   ///< forgets what is begun

Q_SIGNALS:
    void changed(); ///< candidates or the preliminary text
    void committed(const QString& text);

protected:
    void show(const QStringList& candidates, const QString& preliminary)
    {
        if (candidates == m_candidates && preliminary == m_preliminary)
            return;
        m_candidates = candidates;
        m_preliminary = preliminary;
        Q_EMIT changed();
    }

private:
    QStringList m_candidates;
    QString m_preliminary;
};
