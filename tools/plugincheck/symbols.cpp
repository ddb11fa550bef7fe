// SPDX-License-Identifier: MIT
#include "symbols.h"

#include "elffile.h"

#include <QList>

#include <cstdlib>
#include <cxxabi.h>
#include <dlfcn.h>
#include <memory>

namespace {

/// The libraries of a library that cannot be loaded itself; one that is not found makes the answer unknown.
bool openLibraries(const QStringList& names, QList<void*>* handles)
{
    for (const QString& name : names) {
        void* const handle = dlopen(name.toLocal8Bit().constData(), RTLD_LAZY | RTLD_LOCAL);
        if (!handle)
            return false;
        handles->append(handle);
    }
    return true;
}

QString readable(const QByteArray& symbol)
{
    int status = 0;
    const std::unique_ptr<char, decltype(&std::free)> name(
        abi::__cxa_demangle(symbol.constData(), nullptr, nullptr, &status), &std::free);
    return QString::fromLocal8Bit(name ? name.get() : symbol.constData());
}

bool isIn(const QList<void*>& handles, const QByteArray& symbol)
{
    for (void* const handle : handles) {
        dlerror();
        static_cast<void>(dlsym(handle, symbol.constData()));
        if (!dlerror()) // a symbol may well be null
            return true;
    }
    return false;
}

} // namespace

QStringList missingSymbols(const ElfFile& library, void* handle)
{
    QList<void*> handles{RTLD_DEFAULT};
    if (handle)
        handles.append(handle);
    else if (!openLibraries(library.libraries(), &handles))
        return {};
    QStringList missing;
    const QList<QByteArray> needed = library.undefinedSymbols();
    for (const QByteArray& symbol : needed)
        if (!isIn(handles, symbol))
            missing.append(readable(symbol));
    missing.sort();
    return missing;
}
