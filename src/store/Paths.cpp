#include "store/Paths.h"

namespace store {

std::string StripExtension(const std::string& path) {
    const size_t slash = path.rfind('/');
    const size_t dot = path.rfind('.');
    if (dot == std::string::npos) return path;
    if (slash != std::string::npos && dot < slash) return path;
    return path.substr(0, dot);
}

std::string StripTrailingBackslash(const std::string& path) {
    if (!path.empty() && path.back() == '/') return path.substr(0, path.size() - 1);
    return path;
}

std::string FolderOf(const std::string& path) {
    const std::string p = StripTrailingBackslash(path);
    const size_t slash = p.rfind('/');
    if (slash == std::string::npos) return {};
    return p.substr(0, slash + 1);
}

std::string FileNameOf(const std::string& path) {
    const std::string p = StripTrailingBackslash(path);
    const size_t slash = p.rfind('/');
    if (slash == std::string::npos) return {};
    return p.substr(slash + 1);
}

} // namespace store
