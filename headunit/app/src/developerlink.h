// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

/// \brief Answers the questions of developers at the other end of the bridge. GUI thread; one at a time.
///
/// It tells what was decided for keys and intents while DeveloperSource.decisionsWanted, in whichever thread that was, and
/// when everything before a fence has been handled. It passes messages on to the handler that was installed before it, which
/// must outlive it.
class DeveloperLink : public QObject
{
    Q_OBJECT

public:
    explicit DeveloperLink(QObject* parent);
    ~DeveloperLink() override;

private:
    static void handle(QtMsgType type, const QMessageLogContext& context, const QString& message);

    void answerFence(int number);
    void updateWish();

    const QtMessageHandler m_previous;
    bool m_wanted = false;
};
