// Opening and rewriting a file for a command, with messages on standard error.
#pragma once

#include "cli/commands.h"
#include "data/hd_file.h"
#include "files/file_lock.h"

#include <ostream>
#include <string_view>

/// Prints "hdkv: ..." on standard error, in one line, and returns the code.
int Complain(std::string_view message, int code);
/// Says that there is no memory, without asking for any.
int ComplainNoMemory();
/// Says why a file was not read.
int ComplainUnread(const Error& error);
/// Says where the whole content stands if a save of the file was cut off while it was written over.
void TellUnfinished(const std::string& path);

enum class Purpose
{
    Read,
    Rewrite
};

/// Reads an HD parameter file into fresh parameters, in which a date that the file lacks is not set: two runs must not
/// differ. Exit::Fine, or a code after a message. For a rewrite it is told what is not taken as it
/// stands, and a file with content that reading does not keep is refused.
/// `version` is the content that was read.
int OpenFile(const std::string& path, Purpose purpose, HD_Parameters& parameters, FileVersion* version = nullptr);

/// Keeps other programs from writing a file until `lock` goes; waits for one that does. Exit::Fine, or a code after a
/// message that says who has it. A folder that takes no locks is no reason to stop; Rewrite tells of it.
int LockFile(const std::string& path, FileLock& lock);

/// What the file holds, be it one of ours or not; nothing where none can be read.
std::optional<FileVersion> VersionThere(const std::string& path);

/// Saves with everything in it, incomplete lines and encroachment sets included, over the content `expected` only.
/// What `allowed` does not allow is refused with the option that would.
int Rewrite(const HD_Parameters& parameters, const std::string& path, const FileLock& lock, const Output& allowed,
            const std::optional<FileVersion>& expected);
