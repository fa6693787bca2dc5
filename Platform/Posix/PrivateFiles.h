// SPDX-License-Identifier: Apache-2.0
// Files and folders for their owner's eyes only, whatever the umask: 0600 and 0700.
#pragma once

#include <filesystem>
#include <string>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

// Opens a file, for which `flags` may ask open(2) to make it. None, with errno set, when that fails.
FileDescriptor openFile(const std::string& path, int flags);

// A new file. None, with errno set, when there cannot be one or the name is taken.
FileDescriptor createFile(const std::string& path);

// A new file next to `path`, whose name is left in `temporary`. None, with errno set, when there cannot be
// one.
FileDescriptor createBeside(const std::string& path, std::string& temporary);

// Where the symbolic links lead, to a file that is yet to be made perhaps. The last link after too many.
std::string targetOf(const std::string& path);

bool isRegular(const FileDescriptor& file);

// Brings the names in the directory of `path` to the disk. Where that cannot be done nothing is lost but
// that.
void synchroniseDirectoryOf(const std::string& path);

// Makes a folder, and those that it lies in. One that is there keeps its permissions.
void makeFolders(const std::filesystem::path& path);

}  // namespace kelvasi
