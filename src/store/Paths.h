#pragma once
#include <string>

// Small helpers that build and take apart the names of the picture store.
// The separator is "/"; none of them touches the file system.
namespace store {

// The path without the extension of its file name: everything from the last
// "." after the last "/" is dropped. A "." in a folder name is never cut.
std::string StripExtension(const std::string& path);
// The path without one trailing "/"; unchanged when it has none or is empty.
std::string StripTrailingBackslash(const std::string& path);
// After dropping one trailing "/": the part up to and including the last "/";
// empty when there is no "/".
std::string FolderOf(const std::string& path);
// After dropping one trailing "/": the part after the last "/"; empty when
// there is no "/" (a bare name yields empty).
std::string FileNameOf(const std::string& path);

} // namespace store
