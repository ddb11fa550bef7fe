// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <cstdint>

/// \brief What the headers of a shared library say, without loading it.
///
/// Damaged libraries can end the process that loads them, so their bounds are checked first. Nothing of a file is believed.
class ElfFile
{
public:
    /// \brief Why the dynamic linker cannot even begin with the file.
    enum Defect {
        None,
        NotElf,            ///< some other kind of file
        OtherArchitecture, ///< for another processor
        NotALibrary,       ///< a program or an object file
        Damaged,           ///< headers or contents lie outside of the file
    };

    explicit ElfFile(const QString& fileName);

    Defect defect() const { return m_defect; }
    QString explanation() const { return m_explanation; } ///< of the defect, a whole sentence; empty without one

    /// \brief The libraries that it asks for, in its order; empty when it is defective.
    QStringList libraries() const { return m_libraries; }

    /// \brief The symbols that it needs from other libraries, as they are mangled; without weak ones.
    QList<QByteArray> undefinedSymbols() const { return m_undefinedSymbols; }

private:
    void read();
    void fail(Defect defect, const QString& explanation);
    bool checkHeader();
    bool checkSegments();
    void readSections();
    void readSymbols(std::uint64_t offset, std::uint64_t size, std::uint64_t texts, std::uint64_t textsSize);
    void readLibraries(std::uint64_t offset, std::uint64_t size, std::uint64_t texts, std::uint64_t textsSize);
    bool isInside(std::uint64_t offset, std::uint64_t size) const;
    QByteArray text(std::uint64_t texts, std::uint64_t textsSize, std::uint64_t index) const;

    /// A structure at an offset, which may be unaligned in a damaged file.
    template <typename T>
    bool load(std::uint64_t offset, T* value) const;

    const uchar* m_data = nullptr;
    std::uint64_t m_size = 0;
    Defect m_defect = None;
    QString m_explanation;
    QStringList m_libraries;
    QList<QByteArray> m_undefinedSymbols;
};
