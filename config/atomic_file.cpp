#include "config/atomic_file.h"

#include <wx/log.h>
#include <wx/wfstream.h>

#include <cerrno>
#include <climits>
#include <fcntl.h>
#include <random>
#include <sys/stat.h>
#include <unistd.h>

namespace
{

wxString ErrorText(int error) { return wxSysErrorMsgStr(error); }

// The file system's own spelling of the path; empty when the name cannot be spelled there.
std::string NativePath(const wxString& path)
{
    const wxScopedCharBuffer native = path.fn_str();
    return native.length() ? std::string(native.data(), native.length()) : std::string();
}

std::string FolderOf(const std::string& path)
{
    const size_t slash = path.rfind('/');
    if (slash == std::string::npos)
        return ".";
    return slash == 0 ? "/" : path.substr(0, slash);
}

std::string NameOf(const std::string& path)
{
    const size_t slash = path.rfind('/');
    return slash == std::string::npos ? path : path.substr(slash + 1);
}

// Follows symbolic links to the path of the file itself, which need not exist yet: replacing
// the link instead would cut it from the file that others reach through it.
bool ResolveLinks(std::string& path, int& error)
{
    for (int hops = 0; hops < 40; ++hops)
    {
        struct stat info;
        if (lstat(path.c_str(), &info) != 0)
        {
            if (errno == ENOENT)
                return true; // a new file, or a link to one
            error = errno;
            return false;
        }
        if (!S_ISLNK(info.st_mode))
            return true;
        char target[PATH_MAX];
        const ssize_t length = readlink(path.c_str(), target, sizeof target);
        if (length < 0 || length == ssize_t(sizeof target))
        {
            error = length < 0 ? errno : ENAMETOOLONG;
            return false;
        }
        const std::string next(target, size_t(length));
        path = next[0] == '/' ? next : FolderOf(path) + "/" + next;
    }
    error = ELOOP;
    return false;
}

bool WriteAll(int fd, const std::string& bytes)
{
    const char* data = bytes.data();
    size_t left = bytes.size();
    while (left > 0)
    {
        const ssize_t written = write(fd, data, left);
        if (written < 0)
        {
            if (errno == EINTR)
                continue;
            return false;
        }
        data += written;
        left -= size_t(written);
    }
    return true;
}

// A name of our own next to the target: created exclusively, so nothing else is overwritten,
// and in the same folder, so that the final rename never crosses a file system.
int CreateTemporary(const std::string& target, std::string& temporary)
{
    std::random_device seed;
    std::mt19937 random(seed());
    // Short enough to stay a valid name next to a target whose own name is near the limit.
    const std::string name = NameOf(target).substr(0, 200);
    for (int attempt = 0; attempt < 100; ++attempt)
    {
        temporary = FolderOf(target) + "/." + name + "." + std::to_string(random()) + ".tmp";
        // 0666 less the umask: the mode a new file would get from any other program.
        const int fd = open(temporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
        if (fd >= 0 || errno != EEXIST)
            return fd;
    }
    errno = EEXIST;
    return -1;
}

void SyncFolder(const std::string& folder)
{
    // Makes the rename itself durable; some file systems cannot sync a folder, which is no error.
    const int fd = open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (fd >= 0)
    {
        fsync(fd);
        close(fd);
    }
}

} // namespace

bool ReadFileBytes(const wxString& path, std::string& bytes, wxString& reason)
{
    wxLogNull quiet; // a failure is the caller's to report, not a message box
    // A pipe or a device would block the program or never end; a folder fails on reading.
    struct stat info;
    const std::string native = NativePath(path);
    if (!native.empty() && stat(native.c_str(), &info) == 0 && !S_ISREG(info.st_mode) &&
        !S_ISDIR(info.st_mode))
    {
        reason = "not a regular file";
        return false;
    }
    errno = 0;
    wxFFileInputStream in(path, "rb");
    if (!in.IsOk())
    {
        reason = ErrorText(errno != 0 ? errno : ENOENT);
        return false;
    }
    std::string read;
    char buffer[64 * 1024];
    for (;;)
    {
        errno = 0;
        in.Read(buffer, sizeof buffer);
        const int error = errno;
        read.append(buffer, in.LastRead());
        // The stream itself does not tell a read error (a folder, a failing disk) from the end.
        if (in.GetFile()->Error())
        {
            reason = ErrorText(error != 0 ? error : EIO);
            return false;
        }
        if (in.LastRead() == 0 || in.GetLastError() != wxSTREAM_NO_ERROR)
            break;
    }
    bytes = std::move(read);
    return true;
}

bool WriteFileAtomically(const wxString& path, const std::string& bytes, wxString& reason)
{
    std::string target = NativePath(path);
    if (target.empty())
    {
        reason = ErrorText(path.empty() ? ENOENT : EINVAL);
        return false;
    }
    int error = 0;
    if (!ResolveLinks(target, error))
    {
        reason = ErrorText(error);
        return false;
    }

    struct stat old;
    const bool exists = stat(target.c_str(), &old) == 0;
    if (exists)
    {
        if (S_ISDIR(old.st_mode))
        {
            reason = ErrorText(EISDIR);
            return false;
        }
        if (!S_ISREG(old.st_mode))
        {
            reason = "not a regular file";
            return false;
        }
        // A write-protected file is refused, as it would be by writing into it in place.
        if (access(target.c_str(), W_OK) != 0)
        {
            reason = ErrorText(errno);
            return false;
        }
    }
    else if (errno != ENOENT)
    {
        reason = ErrorText(errno);
        return false;
    }

    std::string temporary;
    const int fd = CreateTemporary(target, temporary);
    if (fd < 0)
    {
        reason = ErrorText(errno);
        return false;
    }
    bool ok = true;
    if (exists)
    {
        // The owner first: changing it clears the set-id bits that the mode then restores.
        // Only a privileged process may give the file away, so a refusal is no failure.
        [[maybe_unused]] const bool owned = fchown(fd, old.st_uid, old.st_gid) == 0;
        ok = fchmod(fd, old.st_mode & 07777) == 0;
    }
    ok = ok && WriteAll(fd, bytes) && fsync(fd) == 0;
    error = errno;
    if (close(fd) != 0 && ok)
    {
        ok = false;
        error = errno;
    }
    if (ok && rename(temporary.c_str(), target.c_str()) != 0)
    {
        ok = false;
        error = errno;
    }
    if (!ok)
    {
        unlink(temporary.c_str());
        reason = ErrorText(error != 0 ? error : EIO);
        return false;
    }
    SyncFolder(FolderOf(target));
    return true;
}
