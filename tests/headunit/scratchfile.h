// SPDX-License-Identifier: MIT
#pragma once

#include <QFile>
#include <QTemporaryDir>

/// A file in a folder of its own, which is gone with this.
class ScratchFile
{
public:
    explicit ScratchFile(const QString& name)
        : m_path(m_folder.filePath(name))
    {
    }

    /// The file's name, now with this content; empty when it could not be written.
    QString with(const QByteArray& content) const
    {
        QFile file(m_path);
        const bool written =
            file.open(QIODevice::WriteOnly | QIODevice::Truncate) && file.write(content) == content.size();
        return written ? m_path : QString();
    }

    QString folder() const { return m_folder.path(); }

private:
    const QTemporaryDir m_folder;
    const QString m_path;
};
