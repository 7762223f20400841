/* What Debian's C++ run-time library takes from glibc, for programs that are linked with musl, statically. */
#define _GNU_SOURCE
#include <link.h>
#include <stdint.h>
#include <stdlib.h>
#include <sys/random.h>

char __libc_single_threaded = 0;

uint32_t arc4random(void);
uint32_t arc4random(void) {
  uint32_t number;
  if (getrandom(&number, sizeof number, 0) != sizeof number) abort();
  return number;
}

/* Where an exception finds how to unwind the function at an address: the record of glibc 2.35. */
struct dl_find_object {
  unsigned long long flags;
  void *map_start;
  void *map_end;
  struct link_map *link_map;
  void *eh_frame;
  unsigned long long reserved[7];
};

static int find_unwind_table(struct dl_phdr_info *program, size_t size, void *found) {
  (void)size;
  for (int i = 0; i < program->dlpi_phnum; ++i) {
    if (program->dlpi_phdr[i].p_type != PT_GNU_EH_FRAME) continue;
    ((struct dl_find_object *)found)->eh_frame = (void *)(program->dlpi_addr + program->dlpi_phdr[i].p_vaddr);
    return 1;
  }
  return 0;
}

int _dl_find_object(void *address, struct dl_find_object *found);
int _dl_find_object(void *address, struct dl_find_object *found) {
  (void)address; /* There is one object only. */
  return dl_iterate_phdr(find_unwind_table, found) == 1 ? 0 : -1;
}
