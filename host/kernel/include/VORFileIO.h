// Reading and saving files without surprises: reads refuse what is not a regular file or is too
// large; saves write a temporary file beside the target, fsync it, rename it over the target and
// fsync the directory, keeping the previous version as "<name>.bak" when asked.
#pragma once

#include <cstddef>
#include <string>

// False with a reason in error when path is missing, not a regular file, larger than maxBytes,
// or unreadable.
bool VORReadFile(const std::string& path, std::string& content, std::string& error,
                 std::size_t maxBytes = std::size_t{256} << 20);

// False with a reason in error (the target then is byte-identical to before). A symbolic link is
// followed: the file it ends at is replaced and the links stay.
bool VORWriteFileAtomically(const std::string& path, const std::string& content, std::string& error,
                            bool keepBackup = true);

// Removes temporary files that saves of processes no longer running left in dir (a save in
// progress elsewhere keeps its own); returns how many.
int VORRemoveStrayTemporaryFiles(const std::string& dir);
