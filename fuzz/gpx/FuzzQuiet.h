#pragma once

#include <QtGlobal>

// Trace lines of rejected inputs would drown the fuzzer's own output.
inline void silenceQtMessages()
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
}
