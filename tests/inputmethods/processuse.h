// SPDX-License-Identifier: MIT
#pragma once

#include <QDir>

#include <malloc.h>

/// What this process holds at the moment.
namespace ProcessUse {

inline int threadCount()
{
    return int(QDir(QStringLiteral("/proc/self/task")).entryList(QDir::Dirs | QDir::NoDotAndDotDot).size());
}

/// 0 under a sanitizer, which has an allocator of its own and tells itself what is lost.
inline qint64 allocatedBytes()
{
    return qint64(mallinfo2().uordblks);
}

} // namespace ProcessUse
