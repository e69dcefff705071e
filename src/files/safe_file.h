// Writing a file so that at every moment either its old or its new content is there whole, and nobody's change is lost.
#pragma once

#include "files/file_content.h"

#include <functional>
#include <optional>
#include <vector>

/// What is not the writer's to decide, asked before anything has been replaced.
struct WriteQuestion
{
    enum Kind
    {
        ChangedOutside, // somebody wrote another content than `expected`; it will be kept in a copy. Yes: go on
        HardLinks,      // the file has other names. Yes: all get the new content, No: this one alone
        LosesMetadata   // what `lost` names cannot be given to the new file. Yes: go on
    };
    Kind kind;
    std::string path;
    LostMetadata lost{};
    std::uint64_t names = 1; // how many the file has
};
enum class WriteAnswer
{
    Yes,
    No,
    Cancel // nothing is written; the error is operation_canceled
};

struct SafeFileOptions
{
    bool sync = true;                      // wait until the content is on the medium before the old file goes
    PlatformFile* platform = nullptr;      // null for the system's own
    std::optional<FileVersion> expected{}; // the content that may be replaced; none: whatever is found at first
    std::string renameTo{};                // another spelling of the name in the same folder, which it has from then on
    /// The caller holds the file's lock (file_lock.h): what a save that was cut off has left is nobody else's.
    bool isLocked = false;
    /// Without it a file that somebody changed is not replaced (error ChangedOutside), all names of a file get the new
    /// content, and what of the metadata is lost is reported.
    std::function<WriteAnswer(const WriteQuestion&)> ask{};
};

/// The error of a save that would have replaced what somebody else has written. (No file of ours is a running program,
/// of which the system says this.)
inline constexpr std::errc ChangedOutside = std::errc::text_file_busy;

/// What is to be said of a file that was written.
struct WriteReport
{
    std::error_code unconfirmed{}; // why it is not known whether the disk has it: the folder could not be synced
    LostMetadata lost{};
    std::string displaced{};   // where what somebody else wrote at the last moment is kept
    std::error_code unknown{}; // why it is not known whether somebody did, should it not be; it is kept all the same
    std::vector<std::string>
        leftBehind{};             // where what saves had displaced stands that were cut off before they said so
    std::vector<std::string> unfinished{}; // see UnfinishedSaves
    std::error_code notRenamed{}; // it is written, and keeps its spelling
    FileVersion version{};        // what was written
    bool inPlace = false;         // the file itself was written over, as it has several names
};

/// Writes `text` to a temporary sibling, checks every step, and puts it in the place of `path` (UTF-8), which may exist
/// or not. An existing file's permissions, owner and attributes are kept as far as possible, and nobody else may read
/// the new content before; a symbolic link stays one and its target is replaced. On failure the temporary file is gone,
/// the target is what it was, and the error names path and reason. Where a system has lost the target in replacing it,
/// or a file of several names was written half, the whole new content stays beside it and the error names it.
Result<WriteReport> WriteFileSafely(const std::string& path, std::string_view text,
                                    const SafeFileOptions& options = {});

/// What somebody else had written to a file and a save displaced that was cut off before it said so: it gets the name
/// that such a version has, which is given back. Whoever calls holds the file's lock.
std::vector<std::string> NameLeftBehind(const std::string& path, PlatformFile* platform = nullptr);

/// Where the whole new content stands that saves of a file of several names were writing over it when they were cut
/// off: what the file holds itself may be half of it.
std::vector<std::string> UnfinishedSaves(const std::string& path, PlatformFile* platform = nullptr);

/// The first of PATH.WHY-1, -2, ... that is free.
std::string FreeCopyName(const std::string& path, std::string_view why);

struct KeptCopy
{
    std::string path;
    FileVersion version; // what the copy holds
};
/// Keeps a copy of a file beside it under such a name, never over an existing one.
Result<KeptCopy> KeepOriginal(const std::string& path, std::string_view why, PlatformFile* platform = nullptr);

/// The parts of the metadata, and what each is called in English (translations in ks/language).
struct LostPart
{
    bool LostMetadata::*member;
    const char* name;
};
#define TQL_TEXT(context, english) english
inline constexpr LostPart LostParts[] = {
    {&LostMetadata::owner, TQL_TEXT("CKsDocumentFile", "owner")},
    {&LostMetadata::group, TQL_TEXT("CKsDocumentFile", "group")},
    {&LostMetadata::mode, TQL_TEXT("CKsDocumentFile", "mode")},
    {&LostMetadata::accessList, TQL_TEXT("CKsDocumentFile", "access list")},
    {&LostMetadata::attributes, TQL_TEXT("CKsDocumentFile", "extended attributes")}};
#undef TQL_TEXT
/// What of the metadata was lost, in English words: "owner, access list".
std::string LostText(const LostMetadata& lost);
