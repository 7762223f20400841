// The platforms that compositions are measured on.
#pragma once

#include "edid_composer.h"

namespace bench {

/// Platform values, released at the end of the scope.
class values_t {
 public:
  values_t();
  ~values_t();
  values_t(const values_t &) = delete;
  values_t &operator=(const values_t &) = delete;

  platform_values_t *operator->() { return &values_; }
  platform_values_t *get() { return &values_; }

 private:
  platform_values_t values_;
};

/// Makes the store's embedded default platform the current configuration. Throws std::runtime_error when it can't.
void load_default_platform();

/// A store document with the default platform behind @p bytes of other keys, and that it is the current configuration.
void load_default_platform_behind(u32 bytes);

/// Fills values with the modes that the default platform has, and takes audio from the sink.
void fill_sample(values_t *values);

/// Makes both priority lists VICs 1 to @p count.
void prioritize_first_vics(values_t *values, u32 count);

/// Settings of a port below which 3D is offered as the sink has it.
compose_cfg_t sample_settings();

}  // namespace bench
