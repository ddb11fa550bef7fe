// SPDX-License-Identifier: MIT
#include "elfsections.h"

#include <QFile>

#include <cstring>
#include <elf.h>
#include <link.h>

namespace HmiCore {

namespace {

using Header = ElfW(Ehdr);
using Section = ElfW(Shdr);

constexpr uchar ownClass = sizeof(void*) == 8 ? ELFCLASS64 : ELFCLASS32;
constexpr uchar ownOrder = Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? ELFDATA2LSB : ELFDATA2MSB;

struct Bytes
{
    const uchar* begin;
    quint64 size;

    bool has(quint64 offset, quint64 count) const { return count <= size && offset <= size - count; }
    bool has(const Section& section) const { return has(section.sh_offset, section.sh_size); }

    /// It may be unaligned in a damaged file.
    template <typename T>
    T at(quint64 offset) const
    {
        T value;
        std::memcpy(&value, begin + offset, sizeof value);
        return value;
    }
};

bool isForThisMachine(const Header& header)
{
    return std::memcmp(header.e_ident, ELFMAG, SELFMAG) == 0 && header.e_ident[EI_CLASS] == ownClass
           && header.e_ident[EI_DATA] == ownOrder;
}

bool areNamesSound(const Bytes& file, const Section& names)
{
    return names.sh_size > 0 && file.has(names) && file.begin[names.sh_offset + names.sh_size - 1] == '\0';
}

bool areSectionsSound(const Bytes& file)
{
    if (!file.has(0, sizeof(Header)))
        return false;
    const auto header = file.at<Header>(0);
    if (!isForThisMachine(header))
        return false;
    if (header.e_shnum == 0 && header.e_shoff == 0 && header.e_shstrndx == 0)
        return true; // there is no table
    if (header.e_shentsize != sizeof(Section) || header.e_shstrndx >= header.e_shnum
        || !file.has(header.e_shoff, quint64(header.e_shnum) * sizeof(Section)))
        return false;
    const auto section = [&](quint64 index) { return file.at<Section>(header.e_shoff + index * sizeof(Section)); };
    const Section names = section(header.e_shstrndx);
    if (!areNamesSound(file, names))
        return false;
    for (quint64 index = 0; index < header.e_shnum; ++index) {
        const Section one = section(index);
        if (one.sh_name >= names.sh_size || (one.sh_type != SHT_NOBITS && !file.has(one)))
            return false;
    }
    return true;
}

} // namespace

bool hasSoundSections(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly | QIODevice::Unbuffered))
        return false;
    const qint64 size = file.size();
    const uchar* const content = size > 0 ? file.map(0, size) : nullptr;
    return content && areSectionsSound({content, quint64(size)});
}

} // namespace HmiCore
