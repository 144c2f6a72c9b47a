// What an in-process server library needs for its four exported entry points
// (register, unregister, hand out a class factory, may-unload), and what a
// host needs to load such a library.
//
// The library lists its classes once in a ServerModule and implements the
// entry points by forwarding to it:
//
//   extern "C" int32_t DllRegisterServer() { return Module().Register(); }
//
// A host loads it with LoadServerLibrary, which calls DllRegisterServer; from
// then on CreateObject finds its classes.
#ifndef KELQLN_AUTOMATION_SERVER_MODULE_H_
#define KELQLN_AUTOMATION_SERVER_MODULE_H_

#include <atomic>
#include <cstdint>
#include <string>
#include <vector>

#include "automation/class_registry.h"

namespace automation {

// Result codes of the entry points, with the values a COM host expects.
inline constexpr int32_t kSOk = 0;
inline constexpr int32_t kSFalse = 1;
inline constexpr int32_t kClassNotAvailable = static_cast<int32_t>(0x80040111);
inline constexpr int32_t kEPointer = static_cast<int32_t>(0x80004003);
inline constexpr int32_t kEFail = static_cast<int32_t>(0x80004005);

struct ServerClass {
  std::string prog_id;
  std::string class_id;
  Factory factory;
};

// The factory a library hands out for one class. It belongs to the module and
// lives as long as the library; the caller never frees it.
class ClassFactory {
 public:
  explicit ClassFactory(const ServerClass* server_class)
      : class_(server_class) {}
  Object CreateInstance() const { return class_->factory(); }
  const std::string& ProgId() const { return class_->prog_id; }

 private:
  const ServerClass* class_;
};

class ServerModule {
 public:
  explicit ServerModule(std::vector<ServerClass> classes);

  int32_t Register();
  int32_t Unregister();
  // kClassNotAvailable when no class of this module has that identifier.
  int32_t GetClassObject(const char* class_id, const ClassFactory** factory);
  // kSOk when no object of the module is alive, kSFalse otherwise.
  int32_t CanUnloadNow() const;

  // Held by every object of the module's classes, so that CanUnloadNow knows
  // whether any is still alive.
  class LiveObject {
   public:
    explicit LiveObject(ServerModule& module);
    LiveObject(const LiveObject& other);
    LiveObject& operator=(const LiveObject&) { return *this; }
    ~LiveObject();

   private:
    ServerModule& module_;
  };

  int32_t LiveObjects() const { return live_.load(); }

 private:
  std::vector<ServerClass> classes_;
  std::vector<ClassFactory> factories_;
  std::atomic<int32_t> live_{0};
};

// A server library loaded into the process. Loading registers its classes.
class ServerLibrary {
 public:
  // Loads the library at `path` and calls its DllRegisterServer. A library
  // that cannot be loaded or lacks the entry points raises "Error in loading
  // DLL" (48) with the loader's reason.
  static ServerLibrary Load(const std::string& path);

  ServerLibrary(ServerLibrary&& other) noexcept;
  ServerLibrary& operator=(ServerLibrary&&) = delete;
  // Keeps the library loaded: objects of it may still be alive.
  ~ServerLibrary() = default;

  int32_t Register() const;
  int32_t Unregister() const;
  int32_t CanUnloadNow() const;
  const ClassFactory* GetClassObject(const std::string& class_id) const;
  const std::string& Path() const { return path_; }

 private:
  ServerLibrary(std::string path, void* handle);
  void* Symbol(const char* name) const;

  std::string path_;
  void* handle_;
};

}  // namespace automation

#endif  // KELQLN_AUTOMATION_SERVER_MODULE_H_
