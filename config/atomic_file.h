#pragma once

#include <wx/string.h>

#include <string>

// Reads the whole file through an input stream: the file is never opened for writing. Only
// regular files are read. On failure returns false and says why in `reason` (for instance
// "Permission denied").
bool ReadFileBytes(const wxString& path, std::string& bytes, wxString& reason);

// Replaces the file at `path` by `bytes` so that the path names either the whole old file or the
// whole new one at every moment, also across a crash or a full disk: the bytes go to a new file
// in the same folder, are flushed to the disk, and only then take the old file's place. A
// symbolic link stays a link and the file it names is replaced; the file keeps its permission
// bits (and its owner where the process may set it). A file that the process may not write is
// refused, not replaced. On failure returns false with the reason, and the old file is
// untouched.
bool WriteFileAtomically(const wxString& path, const std::string& bytes, wxString& reason);
