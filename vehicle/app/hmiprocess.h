// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QProcess>

/// The HMI that is started for a scenario, and ended after it. What it prints goes where this program's output goes.
class HmiProcess : public QObject
{
    Q_OBJECT

public:
    explicit HmiProcess(QObject* parent = nullptr);
    /// Ends it, if need be by force.
    ~HmiProcess() override;

    void start(const QStringList& programAndArguments, const QString& directory);

Q_SIGNALS:
    /// It could not be started, or ended before its time; \a reason is for people.
    void ended(const QString& reason);

private:
    QProcess m_process;
};
