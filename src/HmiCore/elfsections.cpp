// SPDX-License-Identifier: MIT
#include "elfsections.h"

#include <QFile>

#include <algorithm>
#include <cstring>
#include <elf.h>
#include <fcntl.h>
#include <link.h>
#include <sys/stat.h>
#include <unistd.h>
#include <vector>

namespace HmiCore {

namespace {

using Header = ElfW(Ehdr);
using Section = ElfW(Shdr);

constexpr uchar ownClass = sizeof(void*) == 8 ? ELFCLASS64 : ELFCLASS32;
constexpr uchar ownOrder = Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? ELFDATA2LSB : ELFDATA2MSB;

/// Read in the few places that count: mapping it would take as long as the rest of the scan.
class File
{
public:
    explicit File(const QString& path)
        : m_descriptor(::open(QFile::encodeName(path).constData(), O_RDONLY | O_CLOEXEC))
    {
        struct stat status;
        if (m_descriptor >= 0 && ::fstat(m_descriptor, &status) == 0)
            m_size = quint64(status.st_size);
    }
    ~File()
    {
        if (m_descriptor >= 0)
            ::close(m_descriptor);
    }
    Q_DISABLE_COPY(File)

    bool has(quint64 offset, quint64 count) const { return count <= m_size && offset <= m_size - count; }
    bool has(const Section& section) const { return has(section.sh_offset, section.sh_size); }

    bool read(quint64 offset, void* target, quint64 count) const
    {
        return has(offset, count) && ::pread(m_descriptor, target, count, off_t(offset)) == ssize_t(count);
    }

private:
    const int m_descriptor;
    quint64 m_size = 0;
};

bool isForThisMachine(const Header& header)
{
    return std::memcmp(header.e_ident, ELFMAG, SELFMAG) == 0 && header.e_ident[EI_CLASS] == ownClass
           && header.e_ident[EI_DATA] == ownOrder;
}

bool areNamesSound(const File& file, const Section& names)
{
    char last = 0;
    return names.sh_size > 0 && file.has(names) && file.read(names.sh_offset + names.sh_size - 1, &last, 1)
           && last == '\0';
}

bool areSectionsSound(const File& file)
{
    Header header;
    if (!file.read(0, &header, sizeof header) || !isForThisMachine(header))
        return false;
    if (header.e_shnum == 0 && header.e_shoff == 0 && header.e_shstrndx == 0)
        return true; // there is no table
    if (header.e_shentsize != sizeof(Section) || header.e_shstrndx >= header.e_shnum)
        return false;
    std::vector<Section> sections(header.e_shnum);
    if (!file.read(header.e_shoff, sections.data(), sections.size() * sizeof(Section)))
        return false;
    const Section& names = sections[header.e_shstrndx];
    return areNamesSound(file, names) && std::all_of(sections.cbegin(), sections.cend(), [&](const Section& section) {
               return section.sh_name < names.sh_size && (section.sh_type == SHT_NOBITS || file.has(section));
           });
}

} // namespace

bool hasSoundSections(const QString& path)
{
    return areSectionsSound(File(path));
}

} // namespace HmiCore
