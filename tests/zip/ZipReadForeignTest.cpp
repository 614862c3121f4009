// Archives written by other programs (Info-ZIP zip, python's zipfile,
// LibreOffice) read back byte for byte, from a path and from memory.
#include "ZipReader.h"
#include "ZipTestSupport.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <map>

using namespace ziptest;
using quire::zip::ZipReader;

namespace {

using Entries = std::map<std::string, std::string>;   // UTF-8 name -> content

const char* const pythonWriter = R"(
import os, sys, zipfile
out, mode, root = sys.argv[1:4]
names = sys.argv[4:]
if mode == 'zip64-everywhere':
    # Small thresholds make every offset and size take its Zip64 form.
    zipfile.ZIP64_LIMIT = 1
    zipfile.ZIP_FILECOUNT_LIMIT = 1
method = {'stored': zipfile.ZIP_STORED, 'bzip2': zipfile.ZIP_BZIP2}.get(mode, zipfile.ZIP_DEFLATED)
target = sys.stdout.buffer if mode == 'stream' else out
with zipfile.ZipFile(target, 'w', method) as archive:
    if mode == 'deflated':
        archive.comment = b'an archive comment'
    for name in names:
        data = open(os.path.join(root, name), 'rb').read()
        if mode in ('zip64-forced', 'zip64-everywhere'):
            with archive.open(name, 'w', force_zip64=True) as entry:
                entry.write(data)
        else:
            archive.writestr(name, data)
)";

const char* const pythonDumper = R"(
import os, sys, zipfile
archive, outdir = sys.argv[1:3]
with zipfile.ZipFile(archive) as z:
    names = z.namelist()
    for i, name in enumerate(names):
        open(os.path.join(outdir, str(i)), 'wb').write(z.read(name))
    open(os.path.join(outdir, 'names'), 'wb').write('\n'.join(names).encode('utf-8'))
)";

class ForeignArchives : public ::testing::Test {
protected:
    void SetUp() override
    {
        m_entries["empty.txt"] = "";
        m_entries["tiny.txt"] = "abc";
        m_entries["text.xml"] = sampleText(1, 200000);
        m_entries["random.bin"] = randomBytes(2, 100000);
        m_entries["big.xml"] = sampleText(3, 1500000) + randomBytes(4, 300000);
        m_entries["sub/dir/nested.xml"] = sampleText(5, 10000);
        m_entries["d\xC3\xA9j\xC3\xA0 vu.xml"] = sampleText(6, 777);
        std::filesystem::create_directories(m_dir.file("src/sub/dir"));
        for (const auto& [name, data] : m_entries)
            writeFile(m_dir.file("src/" + name), data);
    }

    std::string nameArgs() const
    {
        std::string args;
        for (const auto& entry : m_entries)
            args += " " + quote(entry.first);
        return args;
    }

    std::vector<std::string> nameList() const
    {
        std::vector<std::string> names;
        for (const auto& entry : m_entries)
            names.push_back(entry.first);
        return names;
    }

    void makeWithPython(const std::string& mode, const std::string& archive)
    {
        std::vector<std::string> args = {archive, mode, m_dir.file("src")};
        for (const std::string& name : nameList())
            args.push_back(name);
        if (mode == "stream") {
            writeFile(m_dir.file("writer.py"), pythonWriter);
            std::string line = std::string(python) + " " + quote(m_dir.file("writer.py"));
            for (const std::string& arg : args)
                line += " " + quote(arg);
            // Through a pipe the writer cannot seek back: it uses data descriptors.
            const CommandResult made = run(line + " | cat > " + quote(archive));
            ASSERT_EQ(made.exitCode, 0) << made.output;
            return;
        }
        const CommandResult made = runPython(m_dir, pythonWriter, args);
        ASSERT_EQ(made.exitCode, 0) << made.output;
    }

    void makeWithInfoZip(const std::string& options, const std::string& archive)
    {
        if (!haveProgram("zip"))
            GTEST_SKIP() << "Info-ZIP zip is not installed";
        const std::string cd = "cd " + quote(m_dir.file("src")) + " && ";
        const CommandResult made = options == "stream"
                                       ? run(cd + "zip -q -X -D - " + nameArgs() + " | cat > " + quote(archive))
                                       : run(cd + "zip -q -X -D " + options + " " + quote(archive) + nameArgs());
        ASSERT_EQ(made.exitCode, 0) << made.output;
    }

    static void expectEntries(ZipReader& reader, const Entries& expected)
    {
        ASSERT_EQ(reader.entryCount(), expected.size());
        for (const auto& [name, data] : expected) {
            const std::size_t index = reader.find(name);
            ASSERT_NE(index, ZipReader::npos) << name;
            EXPECT_EQ(reader.entryNameUtf8(index), name);
            EXPECT_EQ(reader.entrySize(index), data.size()) << name;
            const std::string got = reader.extract(index);
            EXPECT_TRUE(got == data) << name << ": " << got.size() << " bytes instead of " << data.size();
        }
    }

    // Reads the archive from its path, and from a memory copy of it.
    void expectArchiveReadsBack(const std::string& archive, const Entries& expected)
    {
        ZipReader fromPath;
        fromPath.open(archive);
        expectEntries(fromPath, expected);

        const std::string bytes = readFile(archive);
        ZipReader fromMemory;
        fromMemory.open(bytes.data(), bytes.size());
        expectEntries(fromMemory, expected);
    }

    TempDir m_dir;
    Entries m_entries;
};

} // namespace

TEST_F(ForeignArchives, PythonDeflatedWithComment)
{
    makeWithPython("deflated", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, PythonStored)
{
    makeWithPython("stored", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, PythonBzip2)
{
    makeWithPython("bzip2", m_dir.file("a.zip"));
    ZipReader reader;
    reader.open(m_dir.file("a.zip"));
    EXPECT_EQ(reader.entryInfo(reader.find("text.xml")).method, 12);
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, PythonZip64Forced)
{
    makeWithPython("zip64-forced", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, PythonZip64RecordsAndExtraFieldsEverywhere)
{
    makeWithPython("zip64-everywhere", m_dir.file("a.zip"));
    ZipReader reader;
    reader.open(m_dir.file("a.zip"));
    EXPECT_TRUE(reader.archive().centralDir().isZip64());
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, PythonStreamedWithDataDescriptors)
{
    makeWithPython("stream", m_dir.file("a.zip"));
    ZipReader reader;
    reader.open(m_dir.file("a.zip"));
    EXPECT_NE(reader.entryInfo(0).flags() & 0x0008, 0);
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, PrependedDataIsSkipped)
{
    makeWithPython("deflated", m_dir.file("a.zip"));
    writeFile(m_dir.file("sfx.zip"), randomBytes(9, 5000) + readFile(m_dir.file("a.zip")));
    expectArchiveReadsBack(m_dir.file("sfx.zip"), m_entries);
}

TEST_F(ForeignArchives, InfoZipDefault)
{
    makeWithInfoZip("", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, InfoZipBestCompression)
{
    makeWithInfoZip("-9", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, InfoZipStored)
{
    makeWithInfoZip("-0", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, InfoZipBzip2)
{
    makeWithInfoZip("-Z bzip2", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, InfoZipZip64Forced)
{
    makeWithInfoZip("-fz", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, InfoZipStreamed)
{
    makeWithInfoZip("stream", m_dir.file("a.zip"));
    expectArchiveReadsBack(m_dir.file("a.zip"), m_entries);
}

TEST_F(ForeignArchives, InfoZipWithDirectoryEntries)
{
    if (!haveProgram("zip"))
        GTEST_SKIP() << "Info-ZIP zip is not installed";
    const CommandResult made = run("cd " + quote(m_dir.file("src")) + " && zip -q -X -r " + quote(m_dir.file("a.zip")) + " .");
    ASSERT_EQ(made.exitCode, 0) << made.output;
    Entries expected = m_entries;
    expected["sub/"] = "";
    expected["sub/dir/"] = "";
    expectArchiveReadsBack(m_dir.file("a.zip"), expected);
    ZipReader reader;
    reader.open(m_dir.file("a.zip"));
    EXPECT_TRUE(reader.entryInfo(reader.find("sub/")).isDirectory());
}

TEST_F(ForeignArchives, LibreOfficeWorkbookMatchesPythonsReading)
{
    if (!haveProgram("soffice"))
        GTEST_SKIP() << "LibreOffice is not installed";
    writeFile(m_dir.file("book.csv"), "name,value\nalpha,1\nbeta,2.5\ngamma,=B2+B3\n");
    const CommandResult converted =
        run("cd " + quote(m_dir.path()) + " && timeout 180 soffice --headless --norestore " +
            "-env:UserInstallation=file://" + m_dir.file("profile") +
            " --convert-to xlsx --outdir " + quote(m_dir.path()) + " book.csv");
    if (!std::filesystem::exists(m_dir.file("book.xlsx")))
        GTEST_SKIP() << "LibreOffice did not convert: " << converted.output;

    std::filesystem::create_directories(m_dir.file("dump"));
    const CommandResult dumped = runPython(m_dir, pythonDumper, {m_dir.file("book.xlsx"), m_dir.file("dump")});
    ASSERT_EQ(dumped.exitCode, 0) << dumped.output;
    Entries expected;
    const std::string names = readFile(m_dir.file("dump/names"));
    std::size_t start = 0;
    for (int i = 0; start <= names.size(); ++i) {
        std::size_t end = names.find('\n', start);
        if (end == std::string::npos)
            end = names.size();
        expected[names.substr(start, end - start)] = readFile(m_dir.file("dump/" + std::to_string(i)));
        start = end + 1;
    }
    ASSERT_GE(expected.size(), 5u);
    ASSERT_TRUE(expected.count("xl/workbook.xml"));
    expectArchiveReadsBack(m_dir.file("book.xlsx"), expected);
}
