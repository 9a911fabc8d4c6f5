#include "VORFileIO.h"

#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <climits>
#include <csignal>
#include <cerrno>
#include <cstring>
#include <string_view>

namespace {
constexpr std::string_view kTempMarker = ".vortmp.";

std::string Reason(const std::string& what, const std::string& path) {
  return what + " " + path + ": " + std::strerror(errno);
}
std::string DirectoryOf(const std::string& path) {
  auto slash = path.rfind('/');
  if (slash == std::string::npos)
    return ".";
  return slash == 0 ? "/" : path.substr(0, slash);
}
// The file a chain of symbolic links ends at (which need not exist yet), so that a save replaces
// the real document beside its backup and keeps the links. False when the chain loops.
bool FollowLinks(std::string& path) {
  for (int hops = 0; hops < 40; ++hops) {
    struct stat st {};
    if (::lstat(path.c_str(), &st) != 0 || !S_ISLNK(st.st_mode))
      return true;
    std::string target(PATH_MAX, '\0');
    const ssize_t n = ::readlink(path.c_str(), target.data(), target.size());
    if (n < 0)
      return false;
    target.resize(static_cast<size_t>(n));
    path = target.front() == '/' ? target : DirectoryOf(path) + "/" + target;
  }
  errno = ELOOP;
  return false;
}
// A temporary file name ends with the saving process's id.
bool OwnerIsGone(std::string_view name) {
  const auto at = name.rfind(kTempMarker);
  const std::string_view digits = name.substr(at + kTempMarker.size());
  if (digits.empty() || digits.size() > 9 || digits.find_first_not_of("0123456789") != digits.npos)
    return false;  // not one of ours
  const pid_t pid = static_cast<pid_t>(std::stol(std::string(digits)));
  return pid != ::getpid() && ::kill(pid, 0) != 0 && errno == ESRCH;
}
bool WriteAll(int fd, const std::string& content) {
  size_t done = 0;
  while (done < content.size()) {
    ssize_t n = ::write(fd, content.data() + done, content.size() - done);
    if (n < 0) {
      if (errno == EINTR)
        continue;
      return false;
    }
    done += static_cast<size_t>(n);
  }
  return true;
}
}  // namespace

bool VORReadFile(const std::string& path, std::string& content, std::string& error,
                 std::size_t maxBytes) {
  // O_NONBLOCK so that a FIFO named by mistake cannot hang the open.
  int fd = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
  if (fd < 0) {
    error = Reason("cannot open", path);
    return false;
  }
  struct stat st {};
  if (::fstat(fd, &st) != 0 || !S_ISREG(st.st_mode)) {
    ::close(fd);
    error = path + " is not a regular file";
    return false;
  }
  if (static_cast<std::size_t>(st.st_size) > maxBytes) {
    ::close(fd);
    error = path + " is too large (" + std::to_string(st.st_size) + " bytes, at most " +
            std::to_string(maxBytes) + ")";
    return false;
  }
  std::string data(static_cast<size_t>(st.st_size), '\0');
  size_t done = 0;
  while (done < data.size()) {
    ssize_t n = ::read(fd, data.data() + done, data.size() - done);
    if (n < 0 && errno == EINTR)
      continue;
    if (n <= 0)
      break;
    done += static_cast<size_t>(n);
  }
  ::close(fd);
  if (done != data.size()) {
    error = "cannot read all of " + path;
    return false;
  }
  content.swap(data);
  return true;
}

bool VORWriteFileAtomically(const std::string& named, const std::string& content,
                            std::string& error, bool keepBackup) {
  std::string path = named;
  if (!FollowLinks(path)) {
    error = Reason("cannot follow the links of", named);
    return false;
  }
  const std::string dir = DirectoryOf(path);
  VORRemoveStrayTemporaryFiles(dir);
  const std::string temp = path + std::string(kTempMarker) + std::to_string(::getpid());
  int fd = ::open(temp.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0644);
  if (fd < 0) {
    error = Reason("cannot create", temp);
    return false;
  }
  if (!WriteAll(fd, content) || ::fsync(fd) != 0) {
    error = Reason("cannot write", path);
    ::close(fd);
    ::unlink(temp.c_str());
    return false;
  }
  if (::close(fd) != 0) {
    error = Reason("cannot write", path);
    ::unlink(temp.c_str());
    return false;
  }
  if (keepBackup && ::access(path.c_str(), F_OK) == 0) {
    // A hard link keeps the old version under the backup name without a window where the
    // target is missing.
    // Linked under a temporary name first, then renamed: a kill at any moment leaves either the
    // previous backup or the new one, never none.
    const std::string backup = path + ".bak";
    const std::string backupTemp = backup + std::string(kTempMarker) + std::to_string(::getpid());
    ::unlink(backupTemp.c_str());
    if (::link(path.c_str(), backupTemp.c_str()) != 0 ||
        ::rename(backupTemp.c_str(), backup.c_str()) != 0) {
      error = Reason("cannot keep backup", backup);
      ::unlink(backupTemp.c_str());
      ::unlink(temp.c_str());
      return false;
    }
  }
  if (::rename(temp.c_str(), path.c_str()) != 0) {
    error = Reason("cannot replace", path);
    ::unlink(temp.c_str());
    return false;
  }
  if (int dfd = ::open(dir.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC); dfd >= 0) {
    ::fsync(dfd);
    ::close(dfd);
  }
  return true;
}

int VORRemoveStrayTemporaryFiles(const std::string& dir) {
  DIR* d = ::opendir(dir.c_str());
  if (d == nullptr)
    return 0;
  int removed = 0;
  while (dirent* e = ::readdir(d)) {
    std::string_view name(e->d_name);
    if (name.find(kTempMarker) != std::string_view::npos && OwnerIsGone(name)) {
      if (::unlink((dir + "/" + std::string(name)).c_str()) == 0)
        ++removed;
    }
  }
  ::closedir(d);
  return removed;
}
