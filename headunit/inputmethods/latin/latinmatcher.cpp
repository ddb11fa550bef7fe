// SPDX-License-Identifier: MIT
#include "latinmatcher.h"

#include <QHash>

#include <algorithm>
#include <cmath>
#include <limits>
#include <vector>

namespace Latin::Matcher {

namespace {

struct Row
{
    char16_t character;
    const char* strokes;
};

constexpr Row rows[] = {
#include "templates.inc"
};

// The grid of the rows.
constexpr char origin = 'R';
constexpr double top = -12;
constexpr double capital = 21;

// By trial on one of the recorded hands.
constexpr double strokeTooMany = 0.02; // or too few
constexpr double weightOfHeight = 0.12;
constexpr double weightOfPlace = 0.12;

struct Known
{
    QChar character;
    PointCloud cloud;
};

QList<Stroke> strokesOf(const char* text)
{
    QList<Stroke> strokes{Stroke()};
    for (; *text; ++text) {
        if (*text == ' ') {
            strokes.append(Stroke());
            continue;
        }
        const double x = *text - origin;
        const double y = *++text - origin;
        strokes.last().append(QPointF(x / capital, (y - top) / capital));
    }
    return strokes;
}

const std::vector<Known>& known()
{
    static const std::vector<Known> s_known = [] {
        std::vector<Known> all;
        const QList<Template> list = templates();
        for (const Template& entry : list)
            all.push_back({entry.character, PointCloud(entry.strokes)});
        return all;
    }();
    return s_known;
}

/// What strokes differ in that look alike.
double difference(const PointCloud& a, const PointCloud& b)
{
    const double height = std::abs(a.bounds().height() - b.bounds().height());
    const double place = std::abs(a.bounds().center().y() - b.bounds().center().y());
    return strokeTooMany * std::abs(a.strokeCount() - b.strokeCount()) + weightOfHeight * height
           + weightOfPlace * place;
}

} // namespace

QList<Template> templates()
{
    QList<Template> all;
    for (const Row& row : rows)
        all.append({QChar(row.character), strokesOf(row.strokes)});
    return all;
}

void prepare()
{
    known();
}

QStringList candidates(const QList<Stroke>& strokes, int count)
{
    const PointCloud cloud(strokes);
    QHash<QChar, double> nearest;
    for (const Known& entry : known()) {
        const double best = nearest.value(entry.character, std::numeric_limits<double>::max());
        const double more = difference(cloud, entry.cloud);
        const double distance = more + cloud.distance(entry.cloud, best - more);
        nearest.insert(entry.character, std::min(best, distance));
    }
    QStringList found;
    for (auto entry = nearest.cbegin(); entry != nearest.cend(); ++entry)
        found.append(entry.key());
    std::sort(found.begin(), found.end(), [&nearest](const QString& a, const QString& b) {
        return std::make_pair(nearest.value(a.at(0)), a) < std::make_pair(nearest.value(b.at(0)), b);
    });
    return found.mid(0, count);
}

} // namespace Latin::Matcher
