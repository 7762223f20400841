// Calls between the library's own files that fail when a test wants them to.
//
// Most operations fail for a reason, and tests give them that reason. Some calls can't be given one: their caller has
// made sure that they succeed. What the caller does if they fail all the same is seen by failing them from outside.
#pragma once

namespace robustness {

/// The operations whose calls can be made to fail. A call within the operation's own file is not seen.
enum class operation_name_t {
  ll_init,
  ll_is_initialized,  ///< Answers the contrary.
  ll_entry_at,
  ll_delete_entry,
  ll_delete_entry_at,
  ll_delete_list,
  edid_prepare,
  edid_destroy,
  decode_edid_block_0,
  decode_edid_extensions,
  print_edid_struct,
  convert_vic_to_dtd,
  convert_vic_to_valid_dtd,  ///< convert_vic_to_dtd() whose timing is not valid.
};

/// While it lives, the @p nth call of an operation from its construction on (counted from 1) fails.
class failing_call_t {
 public:
  failing_call_t(operation_name_t operation, int nth);
  ~failing_call_t();
  failing_call_t(const failing_call_t &) = delete;
  failing_call_t &operator=(const failing_call_t &) = delete;

  /// Tells whether the call has failed yet.
  bool happened() const;
};

}  // namespace robustness
