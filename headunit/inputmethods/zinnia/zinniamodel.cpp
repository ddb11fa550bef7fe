// SPDX-License-Identifier: MIT
#include "zinniamodel.h"

#include <QFile>
#include <QHash>
#include <QMutexLocker>

#include <zinnia.h>

namespace Zinnia {

namespace {

constexpr int size = 100; // of the writing area

std::unique_ptr<zinnia::Character> characterOf(const QList<QList<QPoint>>& strokes)
{
    std::unique_ptr<zinnia::Character> character(zinnia::Character::create());
    character->set_width(size);
    character->set_height(size);
    size_t index = 0;
    for (const QList<QPoint>& stroke : strokes) {
        for (const QPoint& point : stroke)
            character->add(index, point.x(), point.y());
        ++index;
    }
    return character;
}

} // namespace

std::shared_ptr<ZinniaModel> ZinniaModel::shared(const QString& file, QString* error)
{
    static QMutex s_lock;
    static QHash<QString, std::weak_ptr<ZinniaModel>> s_models;

    const QMutexLocker locker(&s_lock);
    std::shared_ptr<ZinniaModel> model = s_models.value(file).lock();
    if (model)
        return model;
    std::unique_ptr<zinnia::Recognizer> recognizer(zinnia::Recognizer::create());
    if (!recognizer->open(QFile::encodeName(file).constData())) {
        *error = QString::fromLocal8Bit(recognizer->what());
        return nullptr;
    }
    model.reset(new ZinniaModel(std::move(recognizer)));
    s_models.insert(file, model);
    return model;
}

ZinniaModel::ZinniaModel(std::unique_ptr<zinnia::Recognizer> recognizer)
    : m_recognizer(std::move(recognizer))
{
}

ZinniaModel::~ZinniaModel() = default;

QStringList ZinniaModel::classify(const QList<QList<QPoint>>& strokes, int count) const
{
    QStringList found;
    const std::unique_ptr<zinnia::Character> character = characterOf(strokes);
    const QMutexLocker locker(&m_lock);
    const std::unique_ptr<zinnia::Result> result(m_recognizer->classify(*character, size_t(count)));
    for (size_t i = 0; result && i < result->size(); ++i)
        found.append(QString::fromUtf8(result->value(i)));
    return found;
}

} // namespace Zinnia
