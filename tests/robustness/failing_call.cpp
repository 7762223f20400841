#include "failing_call.h"

#include "edid_composer.h"

namespace robustness {
namespace {

operation_name_t chosen{};
// Number of the call that is to fail, counted from the next one; 0 when none is.
int countdown = 0;

bool fails_now(operation_name_t operation) {
  return countdown > 0 && operation == chosen && --countdown == 0;
}

}  // namespace

failing_call_t::failing_call_t(operation_name_t operation, int nth) {
  chosen = operation;
  countdown = nth;
}

failing_call_t::~failing_call_t() {
  countdown = 0;
}

bool failing_call_t::happened() const {
  return countdown == 0;
}

}  // namespace robustness

using robustness::fails_now;
using robustness::operation_name_t;

// The linker sends the calls here: see CMakeLists.txt. A call that is to fail is not made; one that releases something
// is, and answers that it has failed.
#define WRAP(operation, result_t, parameters, arguments)                              \
  extern "C" result_t __real_##operation parameters;                                  \
  extern "C" result_t __wrap_##operation parameters;                                  \
  result_t __wrap_##operation parameters {                                            \
    return fails_now(operation_name_t::operation) ? 0 : __real_##operation arguments; \
  }

#define WRAP_RELEASE(operation, result_t, parameters, arguments)         \
  extern "C" result_t __real_##operation parameters;                     \
  extern "C" result_t __wrap_##operation parameters;                     \
  result_t __wrap_##operation parameters {                               \
    const result_t result = __real_##operation arguments;                \
    return fails_now(operation_name_t::operation) ? result_t{} : result; \
  }

WRAP(ll_init, bool, (ll_list_t * list, const char *type), (list, type))
WRAP(ll_entry_at, bool, (const ll_list_t *list, i32 index, void **entry_data), (list, index, entry_data))
WRAP(edid_prepare, u8, (edid_t * edid), (edid))
WRAP(decode_edid_block_0, u8, (const u8 *block, edid_t *edid), (block, edid))
WRAP(decode_edid_extensions, u8, (const u8 *extension, u32 length, edid_t *edid), (extension, length, edid))
WRAP(print_edid_struct, u8, (const edid_t *edid, u8 brief, const char *title), (edid, brief, title))
WRAP_RELEASE(ll_delete_entry, bool, (ll_entry_t * entry), (entry))
WRAP_RELEASE(ll_delete_entry_at, bool, (ll_list_t * list, u32 index), (list, index))
WRAP_RELEASE(ll_delete_list, bool, (ll_list_t * list), (list))
WRAP_RELEASE(edid_destroy, u8, (edid_t * edid), (edid))

extern "C" bool __real_ll_is_initialized(const ll_list_t *list);
extern "C" bool __wrap_ll_is_initialized(const ll_list_t *list);
bool __wrap_ll_is_initialized(const ll_list_t *list) {
  const bool answer = __real_ll_is_initialized(list);
  return fails_now(operation_name_t::ll_is_initialized) ? !answer : answer;
}

extern "C" u8 __real_convert_vic_to_dtd(u32 vic, detailed_timing_t *timing);
extern "C" u8 __wrap_convert_vic_to_dtd(u32 vic, detailed_timing_t *timing);
u8 __wrap_convert_vic_to_dtd(u32 vic, detailed_timing_t *timing) {
  if (fails_now(operation_name_t::convert_vic_to_dtd)) return 0;
  const u8 result = __real_convert_vic_to_dtd(vic, timing);
  if (fails_now(operation_name_t::convert_vic_to_valid_dtd)) timing->valid = 0;
  return result;
}
