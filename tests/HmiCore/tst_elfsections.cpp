// SPDX-License-Identifier: MIT
#include "elfsections.h"
#include "jsonfiles.h"

#include <QCoreApplication>

#include <cstring>
#include <elf.h>
#include <functional>
#include <limits>
#include <link.h>

using namespace HmiCore;

namespace {

using Header = ElfW(Ehdr);
using Section = ElfW(Shdr);
using Damage = std::function<void(QByteArray& content, Header& header)>;

Section* section(QByteArray& content, const Header& header, int index)
{
    return reinterpret_cast<Section*>(content.data() + header.e_shoff) + index;
}

} // namespace

Q_DECLARE_METATYPE(Damage)

/// Damage is done to this program itself, which has the form of a library too.
class ElfSectionsTest : public QObject
{
    Q_OBJECT
    Files files;
    QByteArray whole;

    bool isSound(const QByteArray& content)
    {
        files.write(QStringLiteral("plugin.so"), content);
        return hasSoundSections(files.path(QStringLiteral("plugin.so")));
    }

private Q_SLOTS:
    void initTestCase()
    {
        QFile program(QCoreApplication::applicationFilePath());
        QVERIFY(program.open(QIODevice::ReadOnly));
        whole = program.readAll();
        QVERIFY(whole.size() > int(sizeof(Header)));
    }

    void wholeFilesAreSound() { QVERIFY(isSound(whole)); }

    void otherFilesAreNot()
    {
        QVERIFY(!hasSoundSections(files.path(QStringLiteral("missing.so"))));
        QVERIFY(!isSound(QByteArray()));
        QVERIFY(!isSound("text"));
        QVERIFY(!isSound(QByteArray(1000, '\0')));
        QVERIFY(!isSound(whole.left(int(sizeof(Header)) - 1)));
        QVERIFY(!isSound(whole.left(whole.size() / 2)));
    }

    void aFileWithoutTheTableIsSound()
    {
        QByteArray content = whole;
        auto* const header = reinterpret_cast<Header*>(content.data());
        header->e_shoff = 0;
        header->e_shnum = header->e_shstrndx = 0;
        QVERIFY(isSound(content));
    }

    void damageIsSeen_data()
    {
        QTest::addColumn<Damage>("damage");
        const auto row = [](const char* name, Damage damage) { QTest::newRow(name) << damage; };
        using Offset = decltype(Header::e_shoff);
        row("for another machine", [](QByteArray&, Header& header) { header.e_ident[EI_CLASS] ^= 3; });
        row("of another order", [](QByteArray&, Header& header) { header.e_ident[EI_DATA] ^= 3; });
        row("a table behind the file",
            [](QByteArray& content, Header& header) { header.e_shoff = Offset(content.size()); });
        row("a table before the file", [](QByteArray&, Header& header) { header.e_shoff = Offset(0) - 64; });
        row("a table that wraps around",
            [](QByteArray&, Header& header) { header.e_shoff = std::numeric_limits<Offset>::max() - 8; });
        row("more sections than fit", [](QByteArray&, Header& header) { header.e_shnum = 0xfeff; });
        row("no sections, but a table", [](QByteArray&, Header& header) { header.e_shnum = 0; });
        row("sections of another size", [](QByteArray&, Header& header) { header.e_shentsize = 4; });
        row("names in a section that is not there",
            [](QByteArray&, Header& header) { header.e_shstrndx = header.e_shnum; });
        row("names behind the file", [](QByteArray& content, Header& header) {
            section(content, header, header.e_shstrndx)->sh_offset = Offset(content.size());
        });
        row("names without an end", [](QByteArray& content, Header& header) {
            const Section* const names = section(content, header, header.e_shstrndx);
            content.data()[names->sh_offset + names->sh_size - 1] = 'x';
        });
        row("no names at all",
            [](QByteArray& content, Header& header) { section(content, header, header.e_shstrndx)->sh_size = 0; });
        row("a name behind the names",
            [](QByteArray& content, Header& header) { section(content, header, 1)->sh_name = 0x7fffffff; });
        row("a section behind the file", [](QByteArray& content, Header& header) {
            section(content, header, 1)->sh_offset = Offset(content.size());
        });
        row("a section that wraps around", [](QByteArray& content, Header& header) {
            section(content, header, 1)->sh_size = std::numeric_limits<Offset>::max();
        });
    }

    void damageIsSeen()
    {
        QFETCH(Damage, damage);
        QByteArray content = whole;
        content.detach();
        damage(content, *reinterpret_cast<Header*>(content.data()));
        QVERIFY(content != whole);
        QVERIFY(!isSound(content));
    }

    void sectionsThatAreNotStoredMayBeOfAnySize()
    {
        QByteArray content = whole;
        auto* const header = reinterpret_cast<Header*>(content.data());
        int seen = 0;
        for (int i = 0; i < header->e_shnum; ++i) {
            if (section(content, *header, i)->sh_type != SHT_NOBITS)
                continue;
            section(content, *header, i)->sh_size = 1 << 30;
            ++seen;
        }
        QVERIFY(seen > 0);
        QVERIFY(isSound(content));
    }
};

QTEST_GUILESS_MAIN(ElfSectionsTest)
#include "tst_elfsections.moc"
