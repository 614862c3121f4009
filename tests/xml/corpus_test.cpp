#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

namespace {

std::string shell_quote(const std::string& text)
{
    std::string quoted = "'";
    for (const char c : text)
        quoted += c == '\'' ? std::string("'\\''") : std::string(1, c);
    return quoted + "'";
}

int run_comparison(const std::string& arguments)
{
    const std::string command = "/usr/bin/python3 " +
                                shell_quote(std::string(XML_TEST_SCRIPTS_DIR) + "/compare_with_libxml2.py") + " " +
                                shell_quote(XML_DUMP_PATH) + " " + arguments;
    return std::system(command.c_str());
}

bool lxml_available()
{
    return std::system("/usr/bin/python3 -c 'import lxml' 2>/dev/null") == 0;
}

// Every XML part of the workbooks that an independent reader accepts must
// give libxml2's events, both as read and as written back by our writer.
TEST(LibxmlAgreement, CorpusPartsReadAndWriteAsInLibxml2)
{
    const std::filesystem::path corpus = std::filesystem::path(QUIRE_SHARED_DIR) / "corpus";
    if (!std::filesystem::exists(corpus / "MANIFEST.tsv"))
        GTEST_SKIP() << "corpus not available";
    if (!lxml_available())
        GTEST_SKIP() << "python3-lxml not installed";
    const std::string work = std::string(XML_TEST_WORK_DIR) + "/corpus_comparison";
    std::filesystem::create_directories(work);
    EXPECT_EQ(run_comparison(shell_quote(work) + " --corpus " + shell_quote(corpus.string())), 0);
    std::filesystem::remove_all(work);
}

// Small documents that exercise the corners of the syntax.
TEST(LibxmlAgreement, TrickyDocumentsReadAsInLibxml2)
{
    if (!lxml_available())
        GTEST_SKIP() << "python3-lxml not installed";
    const std::vector<std::string> documents = {
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\r\n<a xmlns=\"urn:a\" xmlns:p=\"urn:p\" p:x=\"1\r\n2\t3&#10;\">"
        "t&lt;&#x20AC;<![CDATA[c\r\nd]]><!-- c -->e<?pi?>f<p:b xml:lang=\"en\"/>\r\n</a>",
        "<!DOCTYPE a [<!ENTITY e \"x&#38;#60;y\"><!ENTITY f 'q&e;&amp;'>]><a v='&f;'>&f; &e;</a>",
        "<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?><a b='\xE9'>\xFC\xA0</a>",
        "\xEF\xBB\xBF<a><b xmlns='urn:x'><c xmlns=''/></b>]>&gt;</a>",
        "<a x=\"'\" y='\"'>&apos;&quot;]]&gt;</a>",
    };
    const std::string work = std::string(XML_TEST_WORK_DIR) + "/tricky_comparison";
    std::filesystem::create_directories(work);
    std::string files;
    for (std::size_t i = 0; i < documents.size(); ++i) {
        const std::string path = work + "/tricky" + std::to_string(i) + ".xml";
        std::ofstream(path, std::ios::binary) << documents[i];
        files += " " + shell_quote(path);
    }
    EXPECT_EQ(run_comparison(shell_quote(work + "/run") + " --files" + files), 0);
    std::filesystem::remove_all(work);
}

}  // namespace
