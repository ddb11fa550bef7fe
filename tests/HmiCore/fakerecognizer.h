// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiHandwritingRecognizer>

#include <QPointF>
#include <QSemaphore>
#include <QThread>

#include <atomic>
#include <memory>
#include <utility>

inline QString text(const char* latin1)
{
    return QString::fromLatin1(latin1);
}

inline QVariant stroke(const QList<QPointF>& points)
{
    QVariantList list;
    for (const QPointF& point : points)
        list.append(point);
    return list;
}

/// What an engine keeps apart from its object, so that tests can look at it whatever becomes of that.
struct Work
{
    QSemaphore begun;
    QSemaphore mayEnd;
    std::atomic<bool> waits{false};
    std::atomic<int> finished{0};
    std::atomic<int> destroyed{0};
};

class FakeRecognizer : public HmiCore::HmiHandwritingRecognizer
{
    Q_OBJECT

public:
    explicit FakeRecognizer(std::shared_ptr<Work> shared = std::make_shared<Work>(), QObject* parent = nullptr)
        : HmiCore::HmiHandwritingRecognizer(parent)
        , work(std::move(shared))
    {
    }
    ~FakeRecognizer() override
    {
        marker = 0;
        ++work->destroyed;
    }

    void recognition(const QList<QList<QPoint>>& strokes) override
    {
        QStringList lengths;
        for (const QList<QPoint>& points : strokes)
            lengths.append(QString::number(points.size()));
        note(QStringLiteral("recognition %1").arg(lengths.join(QLatin1Char(','))));
        setCandidates(lengths);
    }
    void process() override { note(QStringLiteral("process")); }
    void newStrokePreProcessing(const QList<QPoint>& points) override
    {
        note(QStringLiteral("stroke %1").arg(points.size()));
    }
    void handleCandidateSelection(int index) override { note(QStringLiteral("candidate %1").arg(index)); }
    using HmiCore::HmiHandwritingRecognizer::setCandidates;

    const std::shared_ptr<Work> work;

Q_SIGNALS:
    void done(const QString& what, QThread* thread);

private:
    void note(const QString& what)
    {
        work->begun.release();
        if (work->waits)
            work->mayEnd.acquire();
        if (marker != 4711)
            qFatal("the engine lost its object");
        ++work->finished;
        Q_EMIT done(what, QThread::currentThread());
    }

    int marker = 4711;
};

/// Deletes a recognizer in the manner that is safe while its engine works.
struct DeleteLater
{
    void operator()(QObject* object) const { object->deleteLater(); }
};
template <typename Recognizer>
using Owned = std::unique_ptr<Recognizer, DeleteLater>;
