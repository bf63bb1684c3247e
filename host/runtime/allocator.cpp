// The host allocator: plain malloc, with a test hook that refuses the Nth request.
#include <cstdlib>

#include "frame/host_runtime.h"
#include "host/runtime/host.h"

void* hoteAllouer(std::size_t taille) noexcept {
  host::Host* h = host::Host::active_or_null();
  if (h != nullptr && !h->allocation_allowed()) return nullptr;
  return std::malloc(taille == 0 ? 1 : taille);
}

void hoteLiberer(void* memoire) noexcept { std::free(memoire); }
