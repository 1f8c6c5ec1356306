// Preloaded into a program: fails the calls by which files are kept, or takes its time over them.
//
//   FAIL_CALL=N     the Nth of these calls fails, with the error number FAIL_ERROR
//   FAIL_MEMORY=N   the Nth allocation fails
//   CALL_DELAY=U    each of these calls takes so many microseconds longer
//   COUNTS_FILE=F   receives how many calls and allocations there were until the program ended

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <new>
#include <type_traits>

namespace {

/// 0 where it is not set.
long Setting(const char* name) {
  const char* text = std::getenv(name);
  return text == nullptr ? 0 : std::atol(text);
}

// Nothing fails before these are set: memory is asked for before there is an environment.
const long g_nFailingCall = Setting("FAIL_CALL");
const long g_nError = Setting("FAIL_ERROR");
const long g_nDelay = Setting("CALL_DELAY");
const long g_nFailingAllocation = Setting("FAIL_MEMORY");
std::atomic<long> g_nCalls;
std::atomic<long> g_nAllocations;

/// The function of that name that would have been called without this library.
template <class Function>
Function* Behind(const char* name) {
  return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

bool CallFails() {
  const timespec time{0, g_nDelay * 1000};
  if (g_nDelay != 0) nanosleep(&time, nullptr);
  if (++g_nCalls != g_nFailingCall) return false;
  errno = static_cast<int>(g_nError);
  return true;
}

bool AllocationFails() { return ++g_nAllocations == g_nFailingAllocation; }

template <class Function, class... Arguments>
auto Call(const char* name, Arguments... arguments) {
  using Result = std::invoke_result_t<Function*, Arguments...>;
  const bool fails = CallFails();
  if constexpr (std::is_pointer_v<Result>) {
    return fails ? nullptr : Behind<Function>(name)(arguments...);
  } else {
    return fails ? Result(-1) : Behind<Function>(name)(arguments...);
  }
}

/// At the end of the program.
struct CountsWriter {
  ~CountsWriter() {
    const char* path = std::getenv("COUNTS_FILE");
    if (path == nullptr) return;
    const long calls = g_nCalls;
    const long allocations = g_nAllocations;
    std::FILE* file = std::fopen(path, "w");
    if (file == nullptr) return;
    std::fprintf(file, "%ld %ld\n", calls, allocations);
    std::fclose(file);
  }
} g_countsWriter;

}  // namespace

extern "C" {

int open(const char* path, int flags, ...) {
  va_list rest;
  va_start(rest, flags);
  const mode_t mode = va_arg(rest, mode_t);  // of no meaning where no file is to be made
  va_end(rest);
  return Call<int(const char*, int, mode_t)>("open", path, flags, mode);
}
std::FILE* fopen64(const char* path, const char* mode) {
  return Call<decltype(fopen64)>("fopen64", path, mode);
}
ssize_t read(int file, void* bytes, std::size_t size) {
  return Call<decltype(read)>("read", file, bytes, size);
}
ssize_t write(int file, const void* bytes, std::size_t size) {
  return Call<decltype(write)>("write", file, bytes, size);
}
int fsync(int file) { return Call<decltype(fsync)>("fsync", file); }
int fchmod(int file, mode_t mode) { return Call<decltype(fchmod)>("fchmod", file, mode); }
int flock(int file, int operation) noexcept {
  return Call<int(int, int)>("flock", file, operation);
}
/// Closes in any case, as the system does.
int close(int file) {
  const int result = Behind<int(int)>("close")(file);
  return CallFails() ? -1 : result;
}
int access(const char* path, int mode) noexcept {
  return Call<int(const char*, int)>("access", path, mode);
}
int stat(const char* path, struct stat* status) noexcept {
  return Call<int(const char*, struct stat*)>("stat", path, status);
}
int lstat(const char* path, struct stat* status) noexcept {
  return Call<int(const char*, struct stat*)>("lstat", path, status);
}
ssize_t readlink(const char* path, char* target, std::size_t size) noexcept {
  return Call<ssize_t(const char*, char*, std::size_t)>("readlink", path, target, size);
}
int mkdir(const char* path, mode_t mode) noexcept {
  return Call<int(const char*, mode_t)>("mkdir", path, mode);
}
int rename(const char* from, const char* to) noexcept {
  return Call<int(const char*, const char*)>("rename", from, to);
}
int unlink(const char* path) noexcept { return Call<int(const char*)>("unlink", path); }

void* malloc(std::size_t size) {
  static auto* const behind = Behind<void*(std::size_t)>("malloc");
  return AllocationFails() ? nullptr : behind(size);
}
void* calloc(std::size_t count, std::size_t size) {
  static auto* const behind = Behind<void*(std::size_t, std::size_t)>("calloc");
  return AllocationFails() ? nullptr : behind(count, size);
}
void* realloc(void* memory, std::size_t size) {
  static auto* const behind = Behind<void*(void*, std::size_t)>("realloc");
  return AllocationFails() ? nullptr : behind(memory, size);
}

}  // extern "C"

// Those of the sanitizers do not come by the above.

void* operator new(std::size_t size) {
  void* const memory = malloc(size);
  if (memory == nullptr) throw std::bad_alloc();
  return memory;
}
void* operator new(std::size_t size, const std::nothrow_t&) noexcept { return malloc(size); }
void operator delete(void* memory) noexcept { std::free(memory); }
void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }
