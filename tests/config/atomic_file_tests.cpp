#include "config/atomic_file.h"

#include <gtest/gtest.h>

#include <wx/log.h>

#include <cerrno>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <functional>
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
        const std::string name = entry.path().lexically_relative(folder).string();
        if (entry.is_symlink())
            entries[name] = "link:" + fs::read_symlink(entry.path()).string();
        else if (entry.is_directory())
            entries[name] = "folder";
        else if (!entry.is_regular_file())
            entries[name] = "other"; // a pipe would block a read
        else
            entries[name] = "file:" + Slurp(entry.path()) + ":" + std::to_string(ModeOf(entry));
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
        fs::permissions(m_dir, fs::perms::owner_all, fs::perm_options::add, ignored);
        fs::remove_all(m_dir, ignored);
    }

    bool Write(const fs::path& path, const std::string& bytes)
    {
        m_reason.clear();
        return WriteFileAtomically(wxString(path.string()), bytes, m_reason);
    }

    fs::path m_dir;
    wxString m_reason;
    mode_t m_umask = 0;
};

const std::string NEW_BYTES = "[Defaults]\ngenerate=yes\n";

TEST_F(AtomicFileTest, CreatesANewFileWithTheUsualModeAndNothingElse)
{
    ASSERT_TRUE(Write(m_dir / "new.ini", NEW_BYTES)) << m_reason;
    EXPECT_EQ(Slurp(m_dir / "new.ini"), NEW_BYTES);
    EXPECT_EQ(ModeOf(m_dir / "new.ini"), 0644u);
    EXPECT_EQ(Snapshot(m_dir).size(), 1u); // no temporary file left behind
}

TEST_F(AtomicFileTest, KeepsEveryByteIncludingZeros)
{
    const std::string bytes("a\0b\r\n\xFF\xFE no newline", 19);
    ASSERT_TRUE(Write(m_dir / "binary", bytes)) << m_reason;
    EXPECT_EQ(Slurp(m_dir / "binary"), bytes);
    ASSERT_TRUE(Write(m_dir / "binary", "")) << m_reason;
    EXPECT_EQ(Slurp(m_dir / "binary"), "");
}

class ReplacedMode : public AtomicFileTest, public testing::WithParamInterface<mode_t>
{
};

TEST_P(ReplacedMode, ReplacesTheContentAndKeepsThePermissionBits)
{
    const fs::path file = m_dir / "config.ini";
    Put(file, std::string(5000, 'x')); // longer than the new content: nothing of it may remain
    ASSERT_EQ(chmod(file.c_str(), GetParam()), 0);
    ASSERT_TRUE(Write(file, NEW_BYTES)) << m_reason;
    EXPECT_EQ(Slurp(file), NEW_BYTES);
    EXPECT_EQ(ModeOf(file), GetParam());
    EXPECT_EQ(Snapshot(m_dir).size(), 1u);
}

INSTANTIATE_TEST_SUITE_P(Modes, ReplacedMode, testing::Values(0600u, 0640u, 0755u));

struct LinkCase
{
    const char* name;
    std::function<void(const fs::path& dir)> make; // makes "link.ini" leading to the file
    const char* file;                              // where the content must land
};

class ThroughLink : public AtomicFileTest, public testing::WithParamInterface<LinkCase>
{
};

TEST_P(ThroughLink, ReplacesTheFileAndLeavesTheLinkAsItWas)
{
    GetParam().make(m_dir);
    const auto before = Snapshot(m_dir);
    ASSERT_TRUE(Write(m_dir / "link.ini", NEW_BYTES)) << m_reason;
    EXPECT_EQ(Slurp(m_dir / GetParam().file), NEW_BYTES);
    auto after = Snapshot(m_dir);
    for (const auto& [name, kind] : before)
    {
        if (kind.rfind("link:", 0) == 0)
        {
            EXPECT_EQ(after[name], kind) << name;
        }
    }
    EXPECT_EQ(after.size(), before.size() + (before.count(GetParam().file) ? 0 : 1));
}

INSTANTIATE_TEST_SUITE_P(
    Links, ThroughLink,
    testing::Values(LinkCase{"Relative",
                             [](const fs::path& dir)
                             {
                                 Put(dir / "real.ini", "old");
                                 fs::create_symlink("real.ini", dir / "link.ini");
                             },
                             "real.ini"},
                    LinkCase{"Chain",
                             [](const fs::path& dir)
                             {
                                 fs::create_directory(dir / "store");
                                 Put(dir / "store/real.ini", "old");
                                 fs::create_symlink("real.ini", dir / "store/middle.ini");
                                 fs::create_symlink("store/middle.ini", dir / "link.ini");
                             },
                             "store/real.ini"},
                    LinkCase{"Dangling",
                             [](const fs::path& dir)
                             { fs::create_symlink("later.ini", dir / "link.ini"); },
                             "later.ini"}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(AtomicFileTest, ReplacedLinkTargetKeepsItsMode)
{
    Put(m_dir / "real.ini", "old");
    ASSERT_EQ(chmod((m_dir / "real.ini").c_str(), 0600), 0);
    fs::create_symlink("real.ini", m_dir / "link.ini");
    ASSERT_TRUE(Write(m_dir / "link.ini", NEW_BYTES)) << m_reason;
    EXPECT_EQ(ModeOf(m_dir / "real.ini"), 0600u);
}

struct FailureCase
{
    const char* name;
    const char* path; // below the test folder, which holds keep.ini and the folder sub/
    int error;        // what the reason must name; 0: any reason
    std::function<void(const fs::path& dir)> prepare;
};

class FailedWrite : public AtomicFileTest, public testing::WithParamInterface<FailureCase>
{
};

TEST_P(FailedWrite, ReportsWhyAndTouchesNothing)
{
    Put(m_dir / "keep.ini", "old content\n");
    fs::create_directory(m_dir / "sub");
    Put(m_dir / "sub/inner.ini", "inner\n");
    if (GetParam().prepare)
        GetParam().prepare(m_dir);
    const auto before = Snapshot(m_dir);

    EXPECT_FALSE(Write(m_dir / GetParam().path, NEW_BYTES));
    if (GetParam().error != 0)
    {
        EXPECT_EQ(m_reason, wxSysErrorMsgStr(GetParam().error));
    }
    EXPECT_FALSE(m_reason.empty());
    EXPECT_EQ(Snapshot(m_dir), before);
}

INSTANTIATE_TEST_SUITE_P(
    Failures, FailedWrite,
    testing::Values(FailureCase{"FolderIsAFile", "keep.ini/new.ini", ENOTDIR, nullptr},
                    FailureCase{"PathIsAFolder", "sub", EISDIR, nullptr},
                    FailureCase{"MissingFolder", "missing/new.ini", ENOENT, nullptr},
                    FailureCase{"LinkLoop", "loop.ini", ELOOP,
                                [](const fs::path& dir)
                                {
                                    fs::create_symlink("loop2.ini", dir / "loop.ini");
                                    fs::create_symlink("loop.ini", dir / "loop2.ini");
                                }},
                    FailureCase{"LinkToAFolder", "tosub.ini", EISDIR,
                                [](const fs::path& dir)
                                { fs::create_symlink("sub", dir / "tosub.ini"); }},
                    FailureCase{"NotARegularFile", "fifo", 0,
                                [](const fs::path& dir)
                                { ASSERT_EQ(mkfifo((dir / "fifo").c_str(), 0644), 0); }}),
    [](const auto& info) { return std::string(info.param.name); });

// A file size limit makes the write itself fail half way, as a full disk does, and no
// privilege lifts it.
TEST_F(AtomicFileTest, WriteFailingHalfWayKeepsTheOldFile)
{
    Put(m_dir / "keep.ini", "old content\n");
    const auto before = Snapshot(m_dir);

    struct rlimit saved;
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &saved), 0);
    const auto previousHandler = signal(SIGXFSZ, SIG_IGN);
    struct rlimit small = saved;
    small.rlim_cur = 100;
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &small), 0);
    const bool written = Write(m_dir / "keep.ini", std::string(1000, 'n'));
    setrlimit(RLIMIT_FSIZE, &saved);
    signal(SIGXFSZ, previousHandler);

    EXPECT_FALSE(written);
    EXPECT_EQ(m_reason, wxSysErrorMsgStr(EFBIG));
    EXPECT_EQ(Snapshot(m_dir), before);
}

// Root writes anywhere: these two run only for an ordinary user; the cases above fail for
// everyone.
TEST_F(AtomicFileTest, WriteProtectedFileIsRefused)
{
    if (geteuid() == 0)
        GTEST_SKIP() << "root may write any file";
    Put(m_dir / "keep.ini", "old content\n");
    ASSERT_EQ(chmod((m_dir / "keep.ini").c_str(), 0444), 0);
    const auto before = Snapshot(m_dir);
    EXPECT_FALSE(Write(m_dir / "keep.ini", NEW_BYTES));
    EXPECT_EQ(m_reason, wxSysErrorMsgStr(EACCES));
    EXPECT_EQ(Snapshot(m_dir), before);
}

TEST_F(AtomicFileTest, ReadOnlyFolderIsReported)
{
    if (geteuid() == 0)
        GTEST_SKIP() << "root may write any folder";
    Put(m_dir / "keep.ini", "old content\n");
    const auto before = Snapshot(m_dir);
    ASSERT_EQ(chmod(m_dir.c_str(), 0555), 0);
    EXPECT_FALSE(Write(m_dir / "keep.ini", NEW_BYTES));
    chmod(m_dir.c_str(), 0755);
    EXPECT_EQ(m_reason, wxSysErrorMsgStr(EACCES));
    EXPECT_EQ(Snapshot(m_dir), before);
}

class ReadFileTest : public AtomicFileTest
{
  protected:
    bool Read(const fs::path& path)
    {
        m_reason.clear();
        m_bytes = "unchanged";
        return ReadFileBytes(wxString(path.string()), m_bytes, m_reason);
    }
    std::string m_bytes;
};

TEST_F(ReadFileTest, ReadsEveryByte)
{
    std::string bytes(200000, '\0'); // larger than one buffer
    for (size_t i = 0; i < bytes.size(); ++i)
        bytes[i] = char(i * 7);
    Put(m_dir / "big", bytes);
    ASSERT_TRUE(Read(m_dir / "big")) << m_reason;
    EXPECT_EQ(m_bytes, bytes);
    Put(m_dir / "empty", "");
    ASSERT_TRUE(Read(m_dir / "empty")) << m_reason;
    EXPECT_EQ(m_bytes, "");
}

TEST_F(ReadFileTest, FailuresNameTheirCause)
{
    EXPECT_FALSE(Read(m_dir / "missing.ini"));
    EXPECT_EQ(m_reason, wxSysErrorMsgStr(ENOENT));
    EXPECT_FALSE(Read(m_dir));
    EXPECT_EQ(m_reason, wxSysErrorMsgStr(EISDIR));
    EXPECT_EQ(m_bytes, "unchanged");
    // A pipe with no writer would block the program for good.
    ASSERT_EQ(mkfifo((m_dir / "fifo").c_str(), 0644), 0);
    EXPECT_FALSE(Read(m_dir / "fifo"));
    EXPECT_FALSE(m_reason.empty());
    // A file that exists but whose first page cannot be read: an I/O error that root gets too.
    if (access("/proc/self/mem", R_OK) == 0)
    {
        EXPECT_FALSE(Read("/proc/self/mem"));
        EXPECT_EQ(m_reason, wxSysErrorMsgStr(EIO));
    }
}

} // namespace
