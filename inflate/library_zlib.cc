#include "inflate/library_zlib.h"

#include <dlfcn.h>
#include <link.h>

#include <cstring>
#include <span>

namespace ambrix::inflate {
namespace {

constexpr char kInflate[] = "z_inflate";

template <typename Function>
void findNext(const char* name, Function*& found) {
  found = reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

/// An entry of a library's dynamic section, or 0.
ElfW(Addr) entryOf(const link_map& library, ElfW(Sxword) tag) {
  for (const ElfW(Dyn)* entry = library.l_ld; entry->d_tag != DT_NULL; ++entry)
    if (entry->d_tag == tag) return entry->d_un.d_ptr;
  return 0;
}

/// The places of a library through which it calls others.
std::span<const ElfW(Rela)> callsOf(const link_map& library) {
  if (entryOf(library, DT_PLTREL) != DT_RELA) return {};
  const auto* const first = reinterpret_cast<const ElfW(Rela)*>(entryOf(library, DT_JMPREL));
  return {first, entryOf(library, DT_PLTRELSZ) / sizeof(ElfW(Rela))};
}

/// What a library calls by a name: null when it calls nothing by it.
const void* calledBy(const link_map& library, const char* name) {
  const auto* const symbols = reinterpret_cast<const ElfW(Sym)*>(entryOf(library, DT_SYMTAB));
  const auto* const names = reinterpret_cast<const char*>(entryOf(library, DT_STRTAB));
  for (const ElfW(Rela) & call : callsOf(library)) {
    if (std::strcmp(names + symbols[ELF64_R_SYM(call.r_info)].st_name, name) != 0) continue;
    return *reinterpret_cast<const void* const*>(library.l_addr + call.r_offset);
  }
  return nullptr;
}

}  // namespace

const LibraryZlib& libraryZlib() {
  static const LibraryZlib zlib = [] {
    LibraryZlib found{};
    findNext("z_inflateInit2_", found.init);
    findNext(kInflate, found.inflate);
    findNext("z_inflateEnd", found.end);
    return found;
  }();
  return zlib;
}

bool libraryCalls(int (*function)(ZStream*, int)) {
  const auto* const own = reinterpret_cast<const void*>(libraryZlib().inflate);
  Dl_info info{};
  void* library = nullptr;
  if (own == nullptr || dladdr1(own, &info, &library, RTLD_DL_LINKMAP) == 0) return false;
  return calledBy(*static_cast<const link_map*>(library), kInflate) ==
         reinterpret_cast<const void*>(function);
}

}  // namespace ambrix::inflate
