/* What the headers of Debian's C++ run-time library expect of glibc's, for a compilation with musl's. */
#define __GLIBC_PREREQ(major, minor) 0
#ifdef __cplusplus
#include <locale.h>
#include <pthread.h>
#include <time.h>
typedef locale_t __locale_t;
extern "C" int pthread_cond_clockwait(pthread_cond_t *, pthread_mutex_t *, clockid_t, const struct timespec *);
/* Classes of characters, as that run-time library was compiled with them. */
enum {
  _ISblank = 0x1,
  _IScntrl = 0x2,
  _ISpunct = 0x4,
  _ISalnum = 0x8,
  _ISupper = 0x100,
  _ISlower = 0x200,
  _ISalpha = 0x400,
  _ISdigit = 0x800,
  _ISxdigit = 0x1000,
  _ISspace = 0x2000,
  _ISprint = 0x4000,
  _ISgraph = 0x8000
};
#endif
