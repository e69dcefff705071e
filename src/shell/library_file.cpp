#include "shell/library_file.h"

#include <QCoreApplication>
#include <QFile>
#include <algorithm>
#include <cstring>
#include <vector>

#ifdef __ELF__
#include <link.h>
#endif

namespace {

struct LibraryFile
{
    Q_DECLARE_TR_FUNCTIONS(LibraryFile)
};

#ifdef __ELF__

using FileHeader = ElfW(Ehdr);
using SegmentHeader = ElfW(Phdr);
using SectionHeader = ElfW(Shdr);

/// Up to which byte a part of the file goes; the largest number for one that no file can hold.
quint64 EndOf(quint64 offset, quint64 size)
{
    return offset + size < offset ? ~quint64{0} : offset + size;
}

quint64 EndOf(const SegmentHeader& segment)
{
    return EndOf(segment.p_offset, segment.p_filesz);
}

quint64 EndOf(const SectionHeader& section)
{
    return section.sh_type == SHT_NOBITS ? 0 : EndOf(section.sh_offset, section.sh_size);
}

/// Up to which byte a table of the file, and what its rows name, go.
template <typename Row>
quint64 EndOfTable(QFile& file, quint64 offset, quint64 count)
{
    const quint64 end = EndOf(offset, count * sizeof(Row));
    std::vector<Row> rows(count);
    const auto size = qint64(count * sizeof(Row));
    if (end > quint64(file.size()) || !file.seek(qint64(offset)) ||
        file.read(reinterpret_cast<char*>(rows.data()), size) != size)
        return end;
    quint64 last = end;
    for (const Row& row : rows)
        last = std::max(last, EndOf(row));
    return last;
}

/// Up to which byte the file has to go; 0 when it is no library of this system.
quint64 NeededSize(QFile& file)
{
    FileHeader header{};
    if (file.read(reinterpret_cast<char*>(&header), sizeof header) != sizeof header ||
        std::memcmp(header.e_ident, ELFMAG, SELFMAG) != 0)
        return 0;
    constexpr int ownClass = sizeof(void*) == 8 ? ELFCLASS64 : ELFCLASS32;
    constexpr int ownOrder = Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? ELFDATA2LSB : ELFDATA2MSB;
    const bool own = header.e_ident[EI_CLASS] == ownClass && header.e_ident[EI_DATA] == ownOrder;
    const bool sections = header.e_shnum == 0 || header.e_shentsize == sizeof(SectionHeader);
    if (!own || header.e_type != ET_DYN || header.e_phentsize != sizeof(SegmentHeader) || !sections)
        return 0;
    return std::max(EndOfTable<SegmentHeader>(file, header.e_phoff, header.e_phnum),
                    EndOfTable<SectionHeader>(file, header.e_shoff, header.e_shnum));
}

#else

/// Whatever the system's format, an empty file is of none.
quint64 NeededSize(QFile& file)
{
    return file.size() > 0 ? 1 : 0;
}

#endif

} // namespace

QString WhyNoLibrary(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return file.errorString();
    const quint64 needed = NeededSize(file);
    if (needed == 0)
        return LibraryFile::tr("it is no library of this system");
    if (needed > quint64(file.size()))
        return LibraryFile::tr("the file is cut off, it holds only %1 bytes").arg(file.size());
    return {};
}
