#include "config/atomic_file.h"

#include <gtest/gtest.h>

#include <wx/log.h>

#include <cerrno>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <map>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace
{

std::string Slurp(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

void Put(const fs::path& path, const std::string& bytes)
{
    std::ofstream(path, std::ios::binary) << bytes;
}

mode_t ModeOf(const fs::path& path)
{
    struct stat info;
    return stat(path.c_str(), &info) == 0 ? info.st_mode & 07777 : 0;
}

// Every entry below a folder with its kind and contents: what "untouched" is compared on.
std::map<std::string, std::string> Snapshot(const fs::path& folder)
{
    std::map<std::string, std::string> entries;
    for (const auto& entry : fs::recursive_directory_iterator(folder))
    {
        std::string& kind = entries[entry.path().lexically_relative(folder).string()];
        if (entry.is_symlink())
            kind = "link:" + fs::read_symlink(entry.path()).string();
        else if (!entry.is_regular_file())
            kind = entry.is_directory() ? "folder" : "other"; // a pipe would block a read
        else
            kind = "file:" + Slurp(entry.path()) + ":" + std::to_string(ModeOf(entry));
    }
    return entries;
}

class AtomicFileTest : public testing::Test
{
  protected:
    void SetUp() override
    {
        char pattern[] = "/tmp/atomic_file_tests.XXXXXX";
        ASSERT_NE(mkdtemp(pattern), nullptr);
        m_dir = pattern;
        m_umask = umask(022);
    }
    void TearDown() override
    {
        umask(m_umask);
        std::error_code ignored;
        fs::remove_all(m_dir, ignored);
    }

    bool Write(const char* name, const std::string& bytes)
    {
        m_reason.clear();
        return WriteFileAtomically(wxString((m_dir / name).string()), bytes, m_reason);
    }

    fs::path m_dir;
    wxString m_reason;
    mode_t m_umask = 0;
};

using namespace std::string_literals;
const std::string NEW_BYTES = "[Defaults]\0\r\n\xFF"
                              "generate=yes"s; // every byte counts

TEST_F(AtomicFileTest, ReplacesTheFileALinkNamesAndKeepsItsModeAndNothingElse)
{
    Put(m_dir / "config.ini", std::string(5000, 'x')); // longer: nothing of it may remain
    ASSERT_EQ(chmod((m_dir / "config.ini").c_str(), 0755), 0);
    fs::create_directory(m_dir / "store");
    Put(m_dir / "store/real.ini", "old");
    ASSERT_EQ(chmod((m_dir / "store/real.ini").c_str(), 0600), 0);
    fs::create_symlink("real.ini", m_dir / "store/middle.ini"); // relative to its own folder
    fs::create_symlink("store/middle.ini", m_dir / "link.ini");
    fs::create_symlink("later.ini", m_dir / "dangling.ini");
    auto expected = Snapshot(m_dir);

    for (const char* name : {"new.ini", "config.ini", "link.ini", "dangling.ini"})
        ASSERT_TRUE(Write(name, NEW_BYTES)) << name << ": " << m_reason;
    // Links stay links; no temporary file is left behind.
    const std::string written = "file:" + NEW_BYTES + ":";
    expected["new.ini"] = written + std::to_string(0644);
    expected["config.ini"] = written + std::to_string(0755);
    expected["store/real.ini"] = written + std::to_string(0600);
    expected["later.ini"] = written + std::to_string(0644);
    EXPECT_EQ(Snapshot(m_dir), expected);
}

TEST_F(AtomicFileTest, FailuresReportWhyAndTouchNothing)
{
    Put(m_dir / "keep.ini", "old content\n");
    fs::create_directory(m_dir / "sub");
    fs::create_symlink("loop2.ini", m_dir / "loop.ini");
    fs::create_symlink("loop.ini", m_dir / "loop2.ini");
    fs::create_symlink("sub", m_dir / "tosub.ini");
    ASSERT_EQ(mkfifo((m_dir / "fifo").c_str(), 0644), 0);
    const auto before = Snapshot(m_dir);

    // A file size limit makes the write itself fail half way, as a full disk does, for root too.
    rlimit saved;
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &saved), 0);
    const rlimit small = {16, saved.rlim_max};
    const auto handler = signal(SIGXFSZ, SIG_IGN);
    const std::pair<const char*, int> failures[] = {
        {"keep.ini/new.ini", ENOTDIR}, {"sub", EISDIR}, {"missing/new.ini", ENOENT},
        {"loop.ini", ELOOP},           {"fifo", 0},     {"keep.ini", EFBIG},
        {"tosub.ini", EISDIR}};
    for (const auto& [path, error] : failures)
    {
        SCOPED_TRACE(path);
        setrlimit(RLIMIT_FSIZE, error == EFBIG ? &small : &saved);
        const bool written = Write(path, NEW_BYTES);
        setrlimit(RLIMIT_FSIZE, &saved);
        EXPECT_FALSE(written);
        EXPECT_EQ(m_reason, error != 0 ? wxSysErrorMsgStr(error) : "not a regular file");
        EXPECT_EQ(Snapshot(m_dir), before);
    }
    signal(SIGXFSZ, handler);
    // A write-protected file is refused; root may write anything.
    ASSERT_EQ(chmod((m_dir / "keep.ini").c_str(), 0444), 0);
    EXPECT_EQ(Write("keep.ini", NEW_BYTES), geteuid() == 0);
}

TEST_F(AtomicFileTest, ReadsEveryByteAndNamesTheCauseOfAFailure)
{
    const std::string bytes = std::string(100000, '\0') + std::string(100000, '\xFF'); // > a buffer
    Put(m_dir / "big", bytes);
    std::string read;
    ASSERT_TRUE(ReadFileBytes((m_dir / "big").string(), read, m_reason)) << m_reason;
    EXPECT_EQ(read, bytes);

    ASSERT_EQ(mkfifo((m_dir / "fifo").c_str(), 0644), 0); // with no writer it would block
    const std::pair<fs::path, int> failures[] = {
        {m_dir / "missing", ENOENT},
        {m_dir, EISDIR},
        {"/proc/self/mem", access("/proc/self/mem", R_OK) == 0 ? EIO : errno},
        {m_dir / "fifo", 0}};
    for (const auto& [path, error] : failures)
    {
        SCOPED_TRACE(path);
        read = "unchanged";
        m_reason.clear();
        EXPECT_FALSE(ReadFileBytes(path.string(), read, m_reason));
        EXPECT_EQ(read, "unchanged");
        EXPECT_EQ(m_reason, error != 0 ? wxSysErrorMsgStr(error) : "not a regular file");
    }
}

} // namespace
