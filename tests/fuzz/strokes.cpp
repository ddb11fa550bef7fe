// SPDX-License-Identifier: MIT
// Handwriting: whatever a writing pad hands over becomes points that an engine can take, by the documented rules.
#include "fuzzing.h"

#include <HmiCore/HmiHandwritingRecognizer>

#include <QPointF>
#include <QPointer>

#include <cmath>
#include <limits>

using Fuzzing::check;
using Fuzzing::Input;

namespace {

/// Asked directly here, in this thread; its own one has nothing to do.
class Recognizer : public HmiCore::HmiHandwritingRecognizer
{
public:
    Recognizer()
        : HmiHandwritingRecognizer(nullptr)
    {
    }

    void recognition(const QList<QList<QPoint>>&) override {}
    void process() override {}
    void newStrokePreProcessing(const QList<QPoint>&) override {}
    void handleCandidateSelection(int) override {}
};

/// A value that stands for a point, and the pixels that it counts as.
struct Pixels
{
    QVariant value;
    double x = 0;
    double y = 0;
};

double coordinate(Input& input)
{
    switch (input.below(4)) {
    case 0:
        return input.real();
    case 1:
        return double(input.integer());
    case 2:
        return double(int8_t(input.byte()));
    default:
        return input.byte() / 2.0;
    }
}

Pixels point(Input& input)
{
    switch (input.below(8)) {
    case 0: {
        const QPoint whole(input.integer(), input.integer());
        return {whole, double(whole.x()), double(whole.y())};
    }
    case 1:
        return {QVariant(), 0, 0};
    case 2:
        return {input.text(4), 0, 0};
    case 3:
        return {QVariantList{1, 2}, 0, 0};
    case 4:
        return {input.integer(), 0, 0};
    default: {
        const double x = coordinate(input);
        const double y = coordinate(input);
        return {QPointF(x, y), x, y};
    }
    }
}

/// In per cent of the size, without what is behind the point.
double percent(double pixels, double size)
{
    const double value = pixels * 100.0 / size;
    return std::isnan(value) ? 0 : std::trunc(value);
}

int held(double value)
{
    constexpr auto least = double(std::numeric_limits<int>::min());
    constexpr auto most = double(std::numeric_limits<int>::max());
    return int(std::fmin(std::fmax(value, least), most));
}

QList<QPoint> expected(const QVector<Pixels>& points, double width, double height)
{
    QList<QPoint> kept;
    for (const Pixels& pixels : points) {
        const QPoint next(held(percent(pixels.x, width)), held(percent(pixels.y, height)));
        const double step = kept.isEmpty() ? 2
                                           : std::fabs(double(next.x()) - kept.constLast().x())
                                                 + std::fabs(double(next.y()) - kept.constLast().y());
        if (step >= 2)
            kept.append(next);
    }
    return kept;
}

QString text(const QList<QPoint>& points)
{
    QString text;
    for (const QPoint& point : points)
        text += QStringLiteral("(%1, %2) ").arg(point.x()).arg(point.y());
    return text;
}

void setSize(Input& input, double before, void (HmiCore::HmiHandwritingRecognizer::*set)(double),
             double (HmiCore::HmiHandwritingRecognizer::*get)() const, Recognizer& recognizer)
{
    const double size = coordinate(input);
    (recognizer.*set)(size);
    check((recognizer.*get)() == (size > 0 ? size : before), "a size is taken when it is one", QString::number(size));
}

/// What is no list of points.
QVariant noStroke(Input& input)
{
    const QVariant others[] = {QVariant(),   QStringLiteral("stroke"), QByteArray("stroke"), 7, QPointF(1, 2),
                               QVariantMap()};
    return others[input.below(int(std::size(others)))];
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv)
{
    Fuzzing::start(argc, *argv);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    static auto* const recognizer = new Recognizer; // its thread would have to be waited for
    Input input(data, size);
    recognizer->setInputWidth(100);
    recognizer->setInputHeight(100);
    using Base = HmiCore::HmiHandwritingRecognizer;
    setSize(input, 100, &Base::setInputWidth, &Base::inputWidth, *recognizer);
    setSize(input, 100, &Base::setInputHeight, &Base::inputHeight, *recognizer);
    const double width = recognizer->inputWidth();
    const double height = recognizer->inputHeight();

    QVariantList strokes;
    QList<QList<QPoint>> wanted;
    while (!input.atEnd() && strokes.size() < 20) {
        if (input.below(8) == 0) {
            strokes.append(noStroke(input));
            check(recognizer->normalize(strokes.constLast()).isEmpty(), "what is no list has no points");
            continue;
        }
        QVector<Pixels> points;
        QVariantList values;
        for (int count = input.below(32); count > 0; --count) {
            points.append(point(input));
            values.append(points.constLast().value);
        }
        strokes.append(QVariant(values));
        const QList<QPoint> kept = recognizer->normalize(strokes.constLast());
        const QList<QPoint> want = expected(points, width, height);
        check(kept == want, "a stroke is in per cent, with steps of two",
              text(kept) + QLatin1String("instead of ") + text(want));
        if (!want.isEmpty())
            wanted.append(want);
    }
    check(recognizer->normalize(strokes) == wanted, "empty strokes are left out");
    return 0;
}
