// SPDX-License-Identifier: MIT
#include "startupformats.h"

#include "startuptimeline.h"

#include <QCoreApplication>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QXmlStreamWriter>

#include <algorithm>
#include <cmath>

namespace {

constexpr int labelWidth = 300;
constexpr int scaleWidth = 760;
constexpr int valueWidth = 90;
constexpr int margin = 16;
constexpr int titleHeight = 34;
constexpr int phaseHeight = 26;
constexpr int stepHeight = 18;
constexpr int longestName = 40; // characters; the names of modules come from plugins

struct Style
{
    int height;
    int fontSize;
    const char* fill;
    const char* text;
};

const Style phaseStyle{phaseHeight, 13, "#2f6f9f", "#1c2530"};
const Style stepStyle{stepHeight, 11, "#9cc3de", "#5a6673"};

double milliseconds(qint64 nanoseconds)
{
    return double(nanoseconds) / 1e6;
}

QString number(double value, int decimals = 2)
{
    return QString::number(value, 'f', decimals);
}

QString bounded(const QString& name)
{
    return name.size() <= longestName ? name : name.left(longestName - 1) + QChar(0x2026);
}

/// The phase first, then its steps.
QVector<StartupTimeline::Span> topDown(const StartupTimeline& timeline)
{
    QVector<StartupTimeline::Span> ordered = timeline.spans();
    std::stable_sort(ordered.begin(), ordered.end(), [](const auto& left, const auto& right) {
        return left.begin < right.begin || (left.begin == right.begin && !left.isStep && right.isStep);
    });
    return ordered;
}

/// 1, 2 or 5 times a power of ten, so that there are between five and a dozen lines.
double step(double length)
{
    const double power = std::pow(10, std::floor(std::log10(std::max(length, 0.001) / 5)));
    const double digit = length / 5 / power;
    return power * (digit >= 5 ? 5 : digit >= 2 ? 2 : 1);
}

class Picture
{
public:
    Picture(QByteArray* into, const StartupTimeline& timeline)
        : m_xml(into)
        , m_spans(topDown(timeline))
        , m_length(std::max(milliseconds(timeline.duration()), 0.001))
    {
    }

    void draw()
    {
        int height = titleHeight + 2 * margin;
        for (const auto& span : m_spans)
            height += style(span).height;
        m_xml.writeStartDocument();
        m_xml.writeDefaultNamespace(QStringLiteral("http://www.w3.org/2000/svg"));
        m_xml.writeStartElement(QStringLiteral("svg"));
        const int width = labelWidth + scaleWidth + valueWidth + 2 * margin;
        attributes({{"width", QString::number(width)},
                    {"height", QString::number(height)},
                    {"viewBox", QStringLiteral("0 0 %1 %2").arg(width).arg(height)},
                    {"font-family", QStringLiteral("sans-serif")}});
        box(0, 0, width, height, "#ffffff");
        text(margin, margin + 12,
             QStringLiteral("Start of the process to the first frame: %1 ms").arg(number(m_length, 1)), 15, "#1c2530");
        drawGrid(titleHeight + margin, height - margin);
        int top = titleHeight + margin;
        for (const auto& span : m_spans) {
            drawSpan(span, top);
            top += style(span).height;
        }
        m_xml.writeEndElement();
        m_xml.writeEndDocument();
    }

private:
    static const Style& style(const StartupTimeline::Span& span) { return span.isStep ? stepStyle : phaseStyle; }

    double x(double time) const { return margin + labelWidth + time / m_length * scaleWidth; }

    void drawGrid(int top, int bottom)
    {
        const double distance = step(m_length);
        for (int line = 0; line * distance <= m_length; ++line) {
            const double time = line * distance;
            box(x(time), top, 1, bottom - top, "#e1e6eb");
            text(x(time) + 3, top - 3, number(time, distance < 1 ? 1 : 0), 10, "#5a6673");
        }
    }

    void drawSpan(const StartupTimeline::Span& span, int top)
    {
        const Style& look = style(span);
        const double begin = milliseconds(span.begin);
        const double length = milliseconds(span.end - span.begin);
        const double baseline = top + look.height / 2.0 + look.fontSize * 0.35;
        text(margin + (span.isStep ? 16 : 0), baseline, bounded(span.name), look.fontSize, look.text);
        box(x(begin), top + 2, std::max(length / m_length * scaleWidth, 1.0), look.height - 4, look.fill);
        text(x(begin + length) + 5, baseline, number(length) + QStringLiteral(" ms"), look.fontSize, look.text);
    }

    void attributes(std::initializer_list<std::pair<const char*, QString>> list)
    {
        for (const auto& attribute : list)
            m_xml.writeAttribute(QString::fromLatin1(attribute.first), attribute.second);
    }

    void box(double left, double top, double width, double height, const char* fill)
    {
        m_xml.writeEmptyElement(QStringLiteral("rect"));
        attributes({{"x", number(left)},
                    {"y", number(top)},
                    {"width", number(width)},
                    {"height", number(height)},
                    {"fill", QString::fromLatin1(fill)}});
    }

    void text(double left, double baseline, const QString& words, int size, const char* fill)
    {
        m_xml.writeStartElement(QStringLiteral("text"));
        attributes({{"x", number(left)},
                    {"y", number(baseline)},
                    {"font-size", QString::number(size)},
                    {"fill", QString::fromLatin1(fill)}});
        m_xml.writeCharacters(words);
        m_xml.writeEndElement();
    }

    QXmlStreamWriter m_xml;
    const QVector<StartupTimeline::Span> m_spans;
    const double m_length; ///< ms
};

} // namespace

QByteArray StartupFormats::picture(const StartupTimeline& timeline)
{
    QByteArray svg;
    Picture(&svg, timeline).draw();
    return svg;
}

QByteArray StartupFormats::trace(const StartupTimeline& timeline)
{
    const qint64 process = QCoreApplication::applicationPid();
    QJsonArray events{
        QJsonObject{{QStringLiteral("name"), QStringLiteral("thread_name")},
                    {QStringLiteral("ph"), QStringLiteral("M")},
                    {QStringLiteral("pid"), process},
                    {QStringLiteral("tid"), process},
                    {QStringLiteral("args"), QJsonObject{{QStringLiteral("name"), QStringLiteral("GUI")}}}}};
    const QVector<StartupTimeline::Span> spans = topDown(timeline);
    for (const auto& span : spans)
        events.append(
            QJsonObject{{QStringLiteral("name"), span.name},
                        {QStringLiteral("cat"), span.isStep ? QStringLiteral("step") : QStringLiteral("phase")},
                        {QStringLiteral("ph"), QStringLiteral("X")},
                        {QStringLiteral("ts"), double(span.begin) / 1e3},
                        {QStringLiteral("dur"), double(span.end - span.begin) / 1e3},
                        {QStringLiteral("pid"), process},
                        {QStringLiteral("tid"), process}});
    return QJsonDocument(QJsonObject{{QStringLiteral("displayTimeUnit"), QStringLiteral("ms")},
                                     {QStringLiteral("traceEvents"), events}})
        .toJson();
}

QString StartupFormats::table(const StartupTimeline& timeline)
{
    QString lines = QStringLiteral("   at ms   took ms\n");
    const QVector<StartupTimeline::Span> spans = topDown(timeline);
    for (const auto& span : spans)
        lines += QStringLiteral("%1 %2  %3\n")
                     .arg(number(milliseconds(span.begin)), 8)
                     .arg(number(milliseconds(span.end - span.begin)), 9)
                     .arg((span.isStep ? QStringLiteral("    ") : QString()) + bounded(span.name));
    return lines + QStringLiteral("%1            first frame\n").arg(number(milliseconds(timeline.duration())), 8);
}
