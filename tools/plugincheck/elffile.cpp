// SPDX-License-Identifier: MIT
#include "elffile.h"

#include <QFile>

#include <cstring>
#include <elf.h>
#include <link.h>

namespace {

using Header = ElfW(Ehdr);
using Segment = ElfW(Phdr);
using Section = ElfW(Shdr);
using Symbol = ElfW(Sym);
using Dynamic = ElfW(Dyn);

const struct
{
    int machine;
    const char* name;
} machines[] = {{EM_386, "x86"},      {EM_X86_64, "x86-64"},    {EM_ARM, "ARM"},   {EM_AARCH64, "AArch64"},
                {EM_RISCV, "RISC-V"}, {EM_PPC64, "PowerPC 64"}, {EM_MIPS, "MIPS"}, {EM_S390, "S/390"}};

/// What this program was built for, read from its own header.
Header ownHeader()
{
    Header header{};
    QFile program(QStringLiteral("/proc/self/exe"));
    if (program.open(QIODevice::ReadOnly))
        program.read(reinterpret_cast<char*>(&header), sizeof header);
    return header;
}

QString architecture(int machine, int fileClass, int order)
{
    QString name = QStringLiteral("processor type %1").arg(machine);
    for (const auto& known : machines)
        if (known.machine == machine)
            name = QString::fromLatin1(known.name);
    return QStringLiteral("%1, %2 bits, %3 endian")
        .arg(name)
        .arg(fileClass == ELFCLASS64 ? 64 : 32)
        .arg(order == ELFDATA2MSB ? QStringLiteral("big") : QStringLiteral("little"));
}

} // namespace

ElfFile::ElfFile(const QString& fileName)
{
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly)) {
        fail(NotElf, QStringLiteral("The file cannot be read: %1.").arg(file.errorString()));
        return;
    }
    m_size = std::uint64_t(file.size());
    m_data = file.map(0, file.size());
    read();
    m_data = nullptr;
}

void ElfFile::read()
{
    if (m_size < EI_NIDENT || !m_data || std::memcmp(m_data, ELFMAG, SELFMAG) != 0)
        fail(NotElf, QStringLiteral("It is not a shared library."));
    else if (checkHeader() && checkSegments())
        readSections();
}

void ElfFile::fail(Defect defect, const QString& explanation)
{
    m_defect = defect;
    m_explanation = explanation;
}

template <typename T>
bool ElfFile::load(std::uint64_t offset, T* value) const
{
    if (!isInside(offset, sizeof(T)))
        return false;
    std::memcpy(value, m_data + offset, sizeof(T));
    return true;
}

bool ElfFile::isInside(std::uint64_t offset, std::uint64_t size) const
{
    return offset <= m_size && size <= m_size - offset;
}

bool ElfFile::checkHeader()
{
    static const Header own = ownHeader();
    std::uint16_t machine = 0; // at the same place in all classes
    load(offsetof(Header, e_machine), &machine);
    const bool isForeign = m_data[EI_CLASS] != own.e_ident[EI_CLASS] || m_data[EI_DATA] != own.e_ident[EI_DATA]
                           || machine != own.e_machine;
    if (isForeign) {
        if (m_data[EI_DATA] != own.e_ident[EI_DATA])
            machine = std::uint16_t(machine << 8 | machine >> 8);
        fail(OtherArchitecture, QStringLiteral("It is built for another processor (%1); the head unit is for %2.")
                                    .arg(architecture(machine, m_data[EI_CLASS], m_data[EI_DATA]),
                                         architecture(own.e_machine, own.e_ident[EI_CLASS], own.e_ident[EI_DATA])));
        return false;
    }
    Header header{};
    if (!load(0, &header)) {
        fail(Damaged, QStringLiteral("The file is damaged: it ends within its header."));
        return false;
    }
    if (header.e_type != ET_DYN) {
        fail(NotALibrary, QStringLiteral("It is not a shared library but a program or an object file."));
        return false;
    }
    return true;
}

bool ElfFile::checkSegments()
{
    Header header{};
    load(0, &header);
    std::uint64_t end = std::uint64_t(header.e_shoff) + std::uint64_t(header.e_shnum) * header.e_shentsize;
    for (unsigned i = 0; i < header.e_phnum; ++i) {
        Segment segment{};
        const bool isThere =
            header.e_phentsize == sizeof segment && load(header.e_phoff + std::uint64_t(i) * sizeof segment, &segment);
        if (!isThere) {
            fail(Damaged, QStringLiteral("The file is damaged: its program headers cannot be read."));
            return false;
        }
        if (segment.p_filesz > 0)
            end = qMax(end, std::uint64_t(segment.p_offset) + std::uint64_t(segment.p_filesz));
    }
    if (end > m_size) {
        fail(Damaged, QStringLiteral("The file is damaged or cut off: it has %1 bytes, its headers promise %2.")
                          .arg(m_size)
                          .arg(end));
        return false;
    }
    return true;
}

void ElfFile::readSections()
{
    Header header{};
    load(0, &header);
    if (header.e_shentsize != sizeof(Section))
        return;
    const auto section = [&](unsigned index, Section* found) {
        return index < header.e_shnum && load(header.e_shoff + std::uint64_t(index) * sizeof(Section), found);
    };
    for (unsigned i = 0; i < header.e_shnum; ++i) {
        Section table{};
        Section texts{};
        if (!section(i, &table) || !isInside(table.sh_offset, table.sh_size) || !section(table.sh_link, &texts)
            || !isInside(texts.sh_offset, texts.sh_size))
            continue;
        if (table.sh_type == SHT_DYNSYM)
            readSymbols(table.sh_offset, table.sh_size, texts.sh_offset, texts.sh_size);
        else if (table.sh_type == SHT_DYNAMIC)
            readLibraries(table.sh_offset, table.sh_size, texts.sh_offset, texts.sh_size);
    }
}

void ElfFile::readSymbols(std::uint64_t offset, std::uint64_t size, std::uint64_t texts, std::uint64_t textsSize)
{
    for (std::uint64_t at = offset; at + sizeof(Symbol) <= offset + size; at += sizeof(Symbol)) {
        Symbol symbol{};
        load(at, &symbol);
        const bool isNeeded = symbol.st_shndx == SHN_UNDEF && (symbol.st_info >> 4) == STB_GLOBAL;
        const QByteArray name = isNeeded ? text(texts, textsSize, symbol.st_name) : QByteArray();
        if (!name.isEmpty())
            m_undefinedSymbols.append(name);
    }
}

void ElfFile::readLibraries(std::uint64_t offset, std::uint64_t size, std::uint64_t texts, std::uint64_t textsSize)
{
    for (std::uint64_t at = offset; at + sizeof(Dynamic) <= offset + size; at += sizeof(Dynamic)) {
        Dynamic entry{};
        load(at, &entry);
        if (entry.d_tag == DT_NEEDED)
            m_libraries.append(QString::fromLocal8Bit(text(texts, textsSize, entry.d_un.d_val)));
    }
}

QByteArray ElfFile::text(std::uint64_t texts, std::uint64_t textsSize, std::uint64_t index) const
{
    if (index >= textsSize)
        return QByteArray();
    const char* const begin = reinterpret_cast<const char*>(m_data) + texts + index;
    return QByteArray(begin, int(qstrnlen(begin, uint(qMin<std::uint64_t>(textsSize - index, 4096)))));
}
