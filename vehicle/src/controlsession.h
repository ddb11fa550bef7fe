// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/keyinput.h"
#include "command.h"

#include <QObject>
#include <QQueue>
#include <QTimer>

#include <functional>

namespace HmiVehicle {

class CallLog;
class Connection;
class VehicleService;

/// One client of the control socket: carries out its commands one after the other and answers each. It owns the keys that
/// it presses.
class ControlSession : public QObject
{
    Q_OBJECT

public:
    ControlSession(Connection* connection, VehicleService& service, CallLog& calls, QObject* parent);
    ~ControlSession() override;

private:
    struct Request
    {
        QJsonValue id;
        Command command;
        int timeout;
        bool hasTimeout;
    };

    void take(const QByteArray& line);
    void runNext();
    void run(const Request& request);
    QString runNow(const Command& command, QJsonValue* result);
    void holdKey(const Command& command);

    void expect(const Request& request);
    void expectCall(const Request& request);
    void expectState(const Request& request);
    void expectNothing(const Request& request);
    void expectHmi(const Request& request);
    void succeedWhenSeen();
    void wait(int timeout, std::function<QString()> complaint);

    void succeed(const QJsonValue& result = QJsonValue(QJsonValue::Undefined));
    void fail(const QString& problem);
    void finish();
    void endWait();
    void answer(const QJsonValue& id, const QString& problem, const QJsonValue& result);

    Connection* const m_connection;
    VehicleService& m_service;
    CallLog& m_calls;
    const KeyInput::Owner m_owner;
    QQueue<Request> m_requests;
    bool m_busy = false;
    QObject* m_wait = nullptr; ///< parent of what the present request waits for
};

} // namespace HmiVehicle
