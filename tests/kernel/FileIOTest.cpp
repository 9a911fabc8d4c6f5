#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <filesystem>

#include "TempDir.h"
#include "VORFileIO.h"

namespace {

std::string Read(const std::string& path) {
  std::string content, error;
  EXPECT_TRUE(VORReadFile(path, content, error)) << error;
  return content;
}

TEST(FileIOTest, ReadRefusesWhatIsNotASmallRegularFile) {
  TempDir dir;
  std::string content = "untouched", error;
  EXPECT_FALSE(VORReadFile(dir.Path(), content, error));
  EXPECT_NE(error.find("not a regular file"), std::string::npos);
  const std::string fifo = dir.Path() + "/pipe";
  ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
  EXPECT_FALSE(VORReadFile(fifo, content, error));  // must not hang
  const std::string big = dir.Write("big", std::string(2000, 'x'));
  EXPECT_FALSE(VORReadFile(big, content, error, 1000));
  EXPECT_NE(error.find("too large"), std::string::npos);
  EXPECT_FALSE(VORReadFile(dir.Path() + "/missing", content, error));
  EXPECT_NE(error.find("missing"), std::string::npos);
  EXPECT_EQ(content, "untouched");
}

TEST(FileIOTest, SaveReplacesTheFileAndKeepsTheOldOneAsBackup) {
  TempDir dir;
  const std::string path = dir.Write("line.pprx", "version 1");
  std::string error;
  ASSERT_TRUE(VORWriteFileAtomically(path, "version 2", error)) << error;
  EXPECT_EQ(Read(path), "version 2");
  EXPECT_EQ(Read(path + ".bak"), "version 1");
  ASSERT_TRUE(VORWriteFileAtomically(path, "version 3", error)) << error;
  EXPECT_EQ(Read(path + ".bak"), "version 2");
  // Nothing else is left behind.
  int files = 0;
  for (auto& e : std::filesystem::directory_iterator(dir.Path()))
    files += e.is_regular_file();
  EXPECT_EQ(files, 2);
}

TEST(FileIOTest, FailedSaveLeavesTheOldFileByteIdentical) {
  TempDir dir;
  const std::string path = dir.Write("line.pprx", "precious");
  std::string error;
  // A file-size limit makes the write fail half-way, like a full disk.
  pid_t child = ::fork();
  if (child == 0) {
    std::signal(SIGXFSZ, SIG_IGN);
    rlimit limit{4, 4};
    ::setrlimit(RLIMIT_FSIZE, &limit);
    std::string why;
    bool ok = VORWriteFileAtomically(path, std::string(100, 'y'), why);
    ::_exit(ok ? 1 : 0);
  }
  int status = 0;
  ::waitpid(child, &status, 0);
  EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0) << "the save should have failed";
  EXPECT_EQ(Read(path), "precious");
  EXPECT_EQ(VORRemoveStrayTemporaryFiles(dir.Path()), 0) << "the failed save cleaned up";

  // In a directory that cannot be written the reason names the path.
  if (::geteuid() != 0) {
    ::chmod(dir.Path().c_str(), 0500);
    EXPECT_FALSE(VORWriteFileAtomically(path, "new", error));
    EXPECT_NE(error.find(dir.Path()), std::string::npos);
    ::chmod(dir.Path().c_str(), 0700);
  }
  EXPECT_FALSE(VORWriteFileAtomically(dir.Path() + "/no/such/dir/file", "x", error));
  EXPECT_NE(error.find("no/such/dir"), std::string::npos);
}

TEST(FileIOTest, StrayTemporaryFilesAreCleanedAtStartUp) {
  TempDir dir;
  dir.Write("line.pprx.vortmp.1234", "torn");
  dir.Write("line.pprx", "good");
  EXPECT_EQ(VORRemoveStrayTemporaryFiles(dir.Path()), 1);
  EXPECT_EQ(Read(dir.Path() + "/line.pprx"), "good");
}

}  // namespace
