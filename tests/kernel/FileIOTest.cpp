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

// A process id that certainly belongs to no running process: a child that has been reaped.
pid_t DeadProcessId() {
  pid_t child = ::fork();
  if (child == 0)
    ::_exit(0);
  ::waitpid(child, nullptr, 0);
  return child;
}

TEST(FileIOTest, OnlyTemporaryFilesOfDeadProcessesAreRemoved) {
  TempDir dir;
  const std::string dead = "line.pprx.vortmp." + std::to_string(DeadProcessId());
  const std::string alive = "line.pprx.vortmp." + std::to_string(::getppid());
  dir.Write(dead, "torn");
  dir.Write(alive, "another program is saving");
  dir.Write("line.pprx", "good");
  dir.Write("notes.vortmp.txt", "not ours");
  EXPECT_EQ(VORRemoveStrayTemporaryFiles(dir.Path()), 1);
  EXPECT_FALSE(std::filesystem::exists(dir.Path() + "/" + dead));
  EXPECT_EQ(Read(dir.Path() + "/" + alive), "another program is saving");
  EXPECT_EQ(Read(dir.Path() + "/notes.vortmp.txt"), "not ours");
  EXPECT_EQ(Read(dir.Path() + "/line.pprx"), "good");
}

TEST(FileIOTest, SavingThroughASymbolicLinkReplacesItsTargetAndKeepsTheLink) {
  TempDir dir;
  const std::string real = dir.Write("store/line.pprx", "version 1");
  const std::string link = dir.Path() + "/line.pprx";
  ASSERT_EQ(::symlink("store/line.pprx", link.c_str()), 0);
  const std::string chain = dir.Path() + "/chain.pprx";
  ASSERT_EQ(::symlink(link.c_str(), chain.c_str()), 0);
  std::string error;
  ASSERT_TRUE(VORWriteFileAtomically(chain, "version 2", error)) << error;
  EXPECT_TRUE(std::filesystem::is_symlink(link));
  EXPECT_TRUE(std::filesystem::is_symlink(chain));
  EXPECT_EQ(Read(real), "version 2");
  EXPECT_EQ(Read(real + ".bak"), "version 1");
  EXPECT_FALSE(std::filesystem::exists(link + ".bak"));
  // A link to a file not yet there creates it.
  const std::string dangling = dir.Path() + "/new.pprx";
  ASSERT_EQ(::symlink("store/new.pprx", dangling.c_str()), 0);
  ASSERT_TRUE(VORWriteFileAtomically(dangling, "fresh", error)) << error;
  EXPECT_TRUE(std::filesystem::is_symlink(dangling));
  EXPECT_EQ(Read(dir.Path() + "/store/new.pprx"), "fresh");
  // A loop of links is refused, naming the path.
  const std::string loop = dir.Path() + "/loop";
  ASSERT_EQ(::symlink("loop", loop.c_str()), 0);
  EXPECT_FALSE(VORWriteFileAtomically(loop, "x", error));
  EXPECT_NE(error.find(loop), std::string::npos) << error;
}

}  // namespace
