// SPDX-License-Identifier: MIT
#pragma once

#include <QProcess>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

/// A head unit's directories, laid out in a temporary one around a copy of the program headlesshmi.
class HeadUnitLayout
{
public:
    /// The program goes to \a programDirectory below the base; an empty one is the base itself.
    explicit HeadUnitLayout(const QString& programDirectory = QStringLiteral("bin"));

    QString path(const QString& relative) const { return m_directory.filePath(relative); }

    /// Copies plugins, by their names without extension, to a directory below the base, making it.
    void addPlugins(const QString& directory, const QStringList& names);
    void addModules(const QStringList& names) { addPlugins(QStringLiteral("plugins"), names); }
    void addEngines(const QStringList& names) { addPlugins(QStringLiteral("inputmethod-plugins"), names); }

    void makeDirectory(const QString& directory);
    void writeFile(const QString& relative, const QByteArray& content);

    /// The regular files of a directory in the order in which the file system lists them.
    QStringList filesIn(const QString& directory) const;

    /// Runs the program until it ends; false, with the reason in error(), unless it ended by itself with 0.
    bool run(const QStringList& arguments = {});
    QString error() const { return m_error; }

    /// What the program logged: "D category: message" for debug lines, W for warnings, E for worse.
    QStringList lines() const { return m_lines; }

    /// As lines(), of the core at all levels and of the program itself, from plugin loading to the end, without level and
    /// category; warnings keep a leading "W ".
    QStringList coreLines() const;

private:
    QTemporaryDir m_directory;
    QString m_program;
    QString m_error;
    QStringList m_lines;
};
