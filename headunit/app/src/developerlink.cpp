// SPDX-License-Identifier: MIT
#include "developerlink.h"

#include <AL2HMIBridge/DeveloperSource>
#include <AL2HMIBridge/KeySource>

#include <QLoggingCategory>

#include <atomic>
#include <mutex>
#include <utility>

using AL2HMIBridge::DeveloperSource;
using AL2HMIBridge::KeySource;

namespace {

constexpr char decisions[] = "kest.hmicore.decisions";
constexpr int longestReport = 4096; ///< as the protocol allows

std::mutex linkMutex; ///< messages come from any thread, also while the link is destroyed
DeveloperLink* link = nullptr;
std::atomic<QtMessageHandler> previousHandler{nullptr};

} // namespace

DeveloperLink::DeveloperLink(QObject* parent)
    : QObject(parent)
    , m_previous(qInstallMessageHandler(&DeveloperLink::handle))
{
    previousHandler = m_previous;
    {
        const std::lock_guard<std::mutex> lock(linkMutex);
        link = this;
    }
    DeveloperSource* const developers = DeveloperSource::instance();
    connect(developers, &DeveloperSource::decisionsWantedChanged, this, &DeveloperLink::updateWish);
    connect(developers, &DeveloperSource::fence, this, &DeveloperLink::answerFence);
    connect(KeySource::instance(), &KeySource::fence, this, &DeveloperLink::answerFence);
    updateWish();
}

DeveloperLink::~DeveloperLink()
{
    {
        const std::lock_guard<std::mutex> lock(linkMutex);
        link = nullptr;
    }
    qInstallMessageHandler(m_previous);
}

/// Keys and state may have queued work; what is queued for the answer comes after it.
void DeveloperLink::answerFence(int number)
{
    QMetaObject::invokeMethod(
        this, [number] { DeveloperSource::instance()->fenceReached(number); }, Qt::QueuedConnection);
}

void DeveloperLink::updateWish()
{
    const bool wanted = DeveloperSource::instance()->decisionsWanted();
    if (wanted == std::exchange(m_wanted, wanted))
        return; // rules of others stay as they are
    QLoggingCategory::setFilterRules(wanted ? QLatin1String(decisions) + QStringLiteral(".debug=true") : QString());
}

void DeveloperLink::handle(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    if (const QtMessageHandler previous = previousHandler)
        previous(type, context, message);
    if (qstrcmp(context.category, decisions) != 0)
        return;
    const std::lock_guard<std::mutex> lock(linkMutex);
    if (!link)
        return;
    QMetaObject::invokeMethod(
        link,
        [text = message.left(longestReport)] {
            if (DeveloperSource::instance()->decisionsWanted())
                DeveloperSource::instance()->reportDecision(text);
        },
        Qt::QueuedConnection);
}
