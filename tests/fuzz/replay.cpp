// SPDX-License-Identifier: MIT
// Stands for the fuzzing engine: gives the inputs in files and folders, one after the other, to a fuzzer's function.
#include "fuzzing.h"

#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QStringList>

#include <algorithm>
#include <cstdio>
#include <vector>

namespace {

QStringList filesIn(const QString& path)
{
    if (QFileInfo(path).isFile())
        return {path};
    QStringList files;
    QDirIterator entries(path, QDir::Files);
    while (entries.hasNext())
        files.append(entries.next());
    std::sort(files.begin(), files.end());
    return files;
}

bool replay(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return false;
    std::fprintf(stderr, "%s\n", qPrintable(path)); // the last one named is the one that crashed
    const QByteArray content = file.readAll();
    // A copy of its exact length, so that the sanitizer sees who reads beyond it.
    const std::vector<uint8_t> input(content.cbegin(), content.cend());
    return LLVMFuzzerTestOneInput(input.data(), input.size()) == 0;
}

} // namespace

int main(int argc, char** argv)
{
    QStringList paths;
    for (int i = 1; i < argc; ++i)
        paths.append(QFile::decodeName(argv[i]));
    LLVMFuzzerInitialize(&argc, &argv);
    int count = 0;
    for (const QString& path : paths) {
        const QStringList files = filesIn(path);
        for (const QString& file : files) {
            if (!replay(file))
                return 1;
            ++count;
        }
    }
    std::printf("%d inputs\n", count);
    return count > 0 ? 0 : 1;
}
