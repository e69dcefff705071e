// Files named by paths, in whatever case they are spelt.
#pragma once

#include "base/result.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

/// The path as files and folders are spelt on disk: a project or a list may hold another case, and an editor may have
/// saved a file with its extension in capitals. The path itself when it exists as it stands, or when nothing fits.
KS_API CString KsExistingSpelling(const CString& path);
/// The entry of the path's folder that has its name, be it in another case, and be it a link to nothing; the path itself
/// when there is none. A folder that cannot be read is no empty one: a file would be written a second time, in another
/// case.
KS_API Result<CString> KsExistingEntry(const CString& path);
/// Whether a file's name ends in the extension (with its dot), in whatever case.
KS_API bool KsHasExtension(const CString& path, const CString& extension);
/// An entry of a file dialog for the extension, in lower and upper case.
KS_API CString KsFileFilter(const CString& name, const CString& extension);
/// The name of a file for a text on the screen: one that is very long is cut in its middle.
KS_API CString KsShownFileName(const CString& path);
/// The path, or where something stands there the first of NAME-2, NAME-3, ... that is free.
KS_API CString KsFreeFileName(const CString& path);
/// Names a file, whichever of its paths is given: another spelling, a way through other folders, a link to it.
KS_API CString KsFileKey(const CString& path);
/// Whether two paths name one file as a user means it, in whatever case; an empty path names none. IsSameFile of
/// files/file_content.h tells apart what the file system does.
KS_API bool KsSameFile(const CString& a, const CString& b);
