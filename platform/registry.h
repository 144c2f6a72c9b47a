// A read-only registry shaped like the Windows API, so the system reads its
// settings with the calls and the size rules it would use on Windows. The
// keys and values come from a `.reg` text file (see RegistryStore).
#ifndef KELQLN_PLATFORM_REGISTRY_H_
#define KELQLN_PLATFORM_REGISTRY_H_

#include <cstdint>
#include <string>
#include <string_view>

namespace platform {

class RegistryStore;

// An open key. The two roots are fixed values, never opened or freed; every
// other handle comes from RegOpenKeyEx and goes back through RegCloseKey.
struct RegKey;
using HKEY = RegKey*;

inline const HKEY kHkeyCurrentUser =
    reinterpret_cast<HKEY>(static_cast<uintptr_t>(0x80000001u));
inline const HKEY kHkeyLocalMachine =
    reinterpret_cast<HKEY>(static_cast<uintptr_t>(0x80000002u));

// Value types.
constexpr uint32_t kRegNone = 0;
constexpr uint32_t kRegSz = 1;
constexpr uint32_t kRegExpandSz = 2;
constexpr uint32_t kRegBinary = 3;
constexpr uint32_t kRegDword = 4;
constexpr uint32_t kRegMultiSz = 7;
constexpr uint32_t kRegQword = 11;

// Access rights. Only reading is granted: the store is never written
// through this interface.
constexpr uint32_t kKeyQueryValue = 0x1;
constexpr uint32_t kKeyEnumerateSubKeys = 0x8;
constexpr uint32_t kKeyNotify = 0x10;
constexpr uint32_t kKeyWow6464Key = 0x100;
constexpr uint32_t kKeyWow6432Key = 0x200;
constexpr uint32_t kReadControl = 0x20000;
constexpr uint32_t kKeyRead = 0x20019;

// Result codes.
constexpr int32_t kErrorSuccess = 0;
constexpr int32_t kErrorFileNotFound = 2;
constexpr int32_t kErrorAccessDenied = 5;
constexpr int32_t kErrorInvalidHandle = 6;
constexpr int32_t kErrorInvalidParameter = 87;
constexpr int32_t kErrorMoreData = 234;
constexpr int32_t kErrorBadDb = 1009;

// Opens `sub_key` (backslash-separated, any letter case; empty for `root`
// itself) below `root`. A key exists when the file names it or any key
// below it. `options` is ignored; `sam_desired` may ask for reading only.
int32_t RegOpenKeyEx(HKEY root, std::string_view sub_key, uint32_t options,
                     uint32_t sam_desired, HKEY* result);

// Reads a value of `key` ("" names the default value). With `data` null only
// the type and the size are reported; a buffer smaller than `*size` gives
// kErrorMoreData and the size needed. Strings are UTF-8 with a terminating
// zero, dwords 4 bytes little-endian. `type` may be null.
int32_t RegQueryValueEx(HKEY key, std::string_view value_name, uint32_t* type,
                        uint8_t* data, uint32_t* size);

int32_t RegCloseKey(HKEY key);

// The file behind the registry: $KELQLN_REGISTRY, else
// $XDG_CONFIG_HOME/kelqln/registry.reg, else
// $HOME/.config/kelqln/registry.reg.
std::string RegistryFilePath();

// Reads RegistryFilePath() now. A missing file is an empty registry; a
// malformed one throws automation::Error (kBadFileFormat, naming the line)
// and leaves the registry unusable (kErrorBadDb) until the next load.
void LoadRegistry();

// As LoadRegistry, from `path`.
void UseRegistryFile(const std::string& path);

// Replaces the registry by `store`, for programs that build one in memory.
void UseRegistryStore(RegistryStore store);

// Why the last load failed, or "" when it did not. Without a prior load the
// first RegOpenKeyEx loads the file and answers kErrorBadDb when it is
// malformed; this is the only place its reason can then be read.
std::string RegistryLoadError();

}  // namespace platform

#endif  // KELQLN_PLATFORM_REGISTRY_H_
