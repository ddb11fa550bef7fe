// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QMutex>
#include <QPoint>
#include <QString>
#include <QStringList>

#include <memory>

namespace zinnia {
class Recognizer;
}

namespace Zinnia {

/// \brief A file of what characters look like, mapped into memory once for all who use it. Any thread.
class ZinniaModel
{
public:
    /// \brief The model of a file, opened unless somebody has it; null when that fails, and \a error says why. Takes some
    /// milliseconds.
    static std::shared_ptr<ZinniaModel> shared(const QString& file, QString* error);
    ~ZinniaModel();
    Q_DISABLE_COPY(ZinniaModel)

    /// \brief What \a strokes, in per cent of the writing area and within it, may be, the most likely first. At most \a count, which
    /// is 1 at least.
    QStringList classify(const QList<QList<QPoint>>& strokes, int count) const;

private:
    explicit ZinniaModel(std::unique_ptr<zinnia::Recognizer> recognizer);

    mutable QMutex m_lock; ///< the library does not say whether it may be asked by several threads at once
    std::unique_ptr<zinnia::Recognizer> m_recognizer;
};

} // namespace Zinnia
