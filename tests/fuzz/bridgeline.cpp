// SPDX-License-Identifier: MIT
// One line of the bridge's protocol: taken or refused as its documents say, with exactly that effect.
#include "fuzzing.h"

#include "bridgemodel.h"

#include <AL2HMIBridge/BridgeTester>

using AL2HMIBridge::BridgeTester;
using Fuzzing::check;

namespace {

int s_refusals = 0;

void countRefusal(const QString& message)
{
    if (!message.startsWith(QLatin1String("Line refused on ")))
        return;
    ++s_refusals;
    check(message.size() < 300, "a warning is bounded", message.left(400));
    for (const QChar character : message)
        check(character.isPrint(), "a warning can be shown", message);
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv)
{
    Fuzzing::start(argc, *argv);
    Fuzzing::readLog(countRefusal);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    static BridgeTester tester;
    static BridgeModel model;
    const QByteArray line = Fuzzing::Input(data, size).rest();
    if (Fuzzing::repeatsKeys(line))
        return 0;
    BridgeTester::resetState();
    model.reset();
    s_refusals = 0;
    const bool taken = BridgeTester::sendLine(line);
    check(taken == model.take(line, model.channelOf(line)), "a line is taken exactly when it is right");
    check(s_refusals == (taken ? 0 : 1), "one warning for each refused line");
    const QString difference = model.difference();
    check(difference.isEmpty(), "the sources say what they were told", difference);
    return 0;
}
