// SPDX-License-Identifier: MIT
#include "modulemarks.h"

#include "intenttable.h"
#include "moduleintents.h"

namespace {

constexpr int longestId = 64;

QString problemOf(const IntentTable::Data& data)
{
    const QString id = data.value(0).toString();
    bool isNumber = false;
    const int number = data.value(1).toInt(&isNumber);
    return !id.isEmpty() && id.size() <= longestId && isNumber && number >= 0
               ? QString()
               : ModuleMarks::tr("There is no such mark");
}

} // namespace

ModuleMarks::ModuleMarks(QObject* parent)
    : QObject(parent)
{
    const auto show = [this](const IntentTable::Data& data) {
        m_marks.insert(data.value(0).toString(), data.value(1).toInt());
        Q_EMIT changed();
    };
    HmiCore::HmiIntentManager::instance()->registerIntentHandler(
        new IntentTable({{ModuleIntent::ShowModuleMark, show, {}, problemOf}}, this));
}
