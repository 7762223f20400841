#include "explain/observation.h"

#include "io/standard_output.h"

namespace edid_cli {
namespace {

/// None of no sink. Unseen: the composition decodes it as well, and passes on what the library says of it.
std::optional<decoded_edid_t> decoded(const std::vector<u8> &bytes) {
  const discarded_output_t unseen;
  if (bytes.empty()) {
    return std::nullopt;
  }
  return std::optional<decoded_edid_t>(std::in_place, bytes);
}

}  // namespace

observation_t::observation_t(const composition_options_t &options, given_sink_t sink, std::string platform_name,
                             const line_listener_t &listener)
    : options_(options),
      sink_(std::move(sink)),
      places_(std::move(platform_name)),
      composition_(compose(options, options.ports.first, sink_.bytes, listener, decisions_t::kept)),
      decoded_sink_(decoded(sink_of_stages(sink_.bytes, composition_))),
      reading_(sink_reading(sink_.bytes, composition_)) {}

explained_t observation_t::explained() const {
  static const edid_t no_sink{};
  const edid_t &record = decoded_sink_ ? decoded_sink_->record() : no_sink;
  return {composition_, sink_.bytes, record, sink_.name, reading_, places_, options_};
}

}  // namespace edid_cli
