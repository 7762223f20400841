#include "composition/edid_problems.h"

#include <algorithm>
#include <iterator>

namespace edid_cli {
namespace {

/// The link of HDMI 1.4 (HDMI 1.4a, section 4.2.3).
constexpr u32 fastest_tmds_clock = 340;

/// Where the encoder puts the header of the video data block: after the extension's own and the speakers' block.
constexpr std::size_t video_block_header = 136;
constexpr u8 block_length_mask = 0x1F;

/// What is left out of a composition with HDMI 2, by compose_room_item.
std::string room_item_text(const compose_decision_t &decision) {
  constexpr const char *items[] = {
      "anything else",           "the sink's FreeSync block",     "the sink's HDR dynamic metadata",
      "the sink's HDR10+ block", "the sink's Dolby Vision block", "3D structures beyond the mandatory ones",
      "modes up to VIC 64: ",    "modes in 4:2:0 only: ",         "modes above VIC 64: ",
      "the serial number text"};
  const std::string text = items[decision.code < std::size(items) ? decision.code : 0];
  return text + (text.ends_with(' ') ? std::to_string(decision.value[0]) + " left out" : "");
}

bool is_read(const compose_result_t &result) {
  return result.sink_status == COMPOSE_SINK_READ && result.sink_extension_status == COMPOSE_EXTENSION_READ;
}

class problem_finder_t {
 public:
  problem_finder_t(const composition_t &composition, const edid_t *sink) : composition_(composition), sink_(sink) {}

  std::vector<problem_t> run() && {
    look_at_sink();
    if (!composition_.is_composed) {
      add(problem_kind_t::refused, severity_t::error, "the library refuses to compose: " + composition_.refusal);
      return std::move(problems_);
    }
    for (const compose_decision_t &decision : composition_.decisions) {
      look_at(decision);
    }
    return std::move(problems_);
  }

 private:
  void add(problem_kind_t kind, severity_t severity, std::string text) {
    problems_.push_back({kind, severity, std::move(text)});
  }

  void look_at_sink() {
    const compose_result_t &result = composition_.result;
    if (result.sink_status == 0 || result.sink_status == COMPOSE_SINK_NONE) {
      return;
    }
    const bool is_extension_unread = result.sink_extension_status != COMPOSE_EXTENSION_NOT_ANNOUNCED &&
                                     result.sink_extension_status != COMPOSE_EXTENSION_READ;
    if (result.sink_status != COMPOSE_SINK_READ) {
      add_unread(compose_sink_status_string(result.sink_status));
    } else if (is_extension_unread) {
      add_unread(std::string("extension ") + compose_extension_status_string(result.sink_extension_status));
    }
  }

  void add_unread(const std::string &status) {
    add(problem_kind_t::sink_unread, severity_t::note, "the sink is not read to its end: " + status);
  }

  void look_at(const compose_decision_t &decision) {
    switch (decision.subject) {
      case COMPOSE_SUBJECT_EXTENSION_ROOM:
        look_at_room(decision);
        break;
      case COMPOSE_SUBJECT_PADDING:
        if (decision.reason == COMPOSE_REASON_TOO_FEW_MODES) {
          add(problem_kind_t::too_few_modes, severity_t::warning,
              std::to_string(decision.value[0]) + " modes are offered, but an EDID has " +
                  std::to_string(decision.value[1]) + " at least: VIC 1 stands in for the others");
        }
        break;
      case COMPOSE_SUBJECT_TMDS_CLOCK:
        look_at_tmds_clock(decision);
        break;
      case COMPOSE_SUBJECT_ROOM_ITEM:
        add(problem_kind_t::left_out_for_room, severity_t::note,
            "the extension has no room for " + room_item_text(decision));
        break;
      case COMPOSE_SUBJECT_DEEP_COLOR:
        look_at_deep_color(decision);
        break;
      default:
        break;
    }
  }

  void look_at_room(const compose_decision_t &room) {
    const std::string longest = std::to_string(room.value[2]);
    const std::string most = std::to_string(room.value[3]);
    if (room.reason == COMPOSE_REASON_NOT_ANNOUNCED) {
      add(problem_kind_t::not_announced, severity_t::error,
          "without a name of 2 characters or more that does not begin with a blank, byte 126 stays 0: no source reads "
          "the extension, so there is neither HDMI nor audio");
    }
    if (room.value[2] > room.value[3]) {
      const bool is_video = (composition_.new_edid[video_block_header] & block_length_mask) == 0;
      add(is_video ? problem_kind_t::video_block_too_long : problem_kind_t::hdmi_block_too_long, severity_t::error,
          (is_video ? longest + " modes or more are offered, but a video data block holds " + most
                    : "the HDMI block needs " + longest + " bytes after its header, but can have " + most) +
              ": its length field wraps, and sources read garbage");
    }
    if (room.value[0] > room.value[1]) {
      add(problem_kind_t::extension_full, severity_t::warning,
          "the extension needs " + std::to_string(room.value[0]) + " bytes before its checksum and has " +
              std::to_string(room.value[1]) + ": what comes last is left out, the serial number text first");
    }
  }

  void look_at_tmds_clock(const compose_decision_t &clock) {
    const std::string declared = "a TMDS clock of " + std::to_string(clock.code) + " MHz is declared";
    if (clock.code > fastest_tmds_clock) {
      add(problem_kind_t::tmds_clock_above_hdmi_1_4, severity_t::warning,
          declared + ", but HDMI 1.4 ends at " + std::to_string(fastest_tmds_clock) + " MHz");
    }
    const auto of_sink = static_cast<u32>(clock.value[clock.reason == COMPOSE_REASON_TMDS_OVERRIDE ? 1 : 2]);
    if (sink_ != nullptr && is_read(composition_.result) && of_sink != 0 && clock.code > of_sink) {
      add(problem_kind_t::tmds_clock_above_sink, severity_t::warning,
          declared + ", but the sink takes " + std::to_string(of_sink) + " MHz");
    }
  }

  void look_at_deep_color(const compose_decision_t &depth) {
    if (depth.verdict == COMPOSE_VERDICT_LEFT_OUT || sink_ == nullptr || !is_read(composition_.result)) {
      return;
    }
    const bool sink_has_it = depth.code == 30 ? sink_->dc_30bit != 0 : sink_->dc_36bit != 0;
    const bool is_told = std::any_of(problems_.begin(), problems_.end(), [](const problem_t &problem) {
      return problem.kind == problem_kind_t::deep_color_not_in_sink;
    });
    if (!sink_has_it && !is_told) {
      add(problem_kind_t::deep_color_not_in_sink, severity_t::warning,
          "deep colour of " + std::to_string(depth.code) + " bits is offered, which the sink does not take");
    }
  }

  const composition_t &composition_;
  const edid_t *sink_;
  std::vector<problem_t> problems_;
};

}  // namespace

const char *severity_text(severity_t severity) {
  return severity == severity_t::error ? "error" : severity == severity_t::warning ? "warning" : "note";
}

std::vector<problem_t> problems_of(const composition_t &composition, const edid_t *sink) {
  return problem_finder_t(composition, sink).run();
}

std::vector<std::string> reasons_against(const composition_t &composition) {
  std::vector<std::string> reasons;
  for (problem_t &problem : problems_of(composition)) {
    if (problem.severity == severity_t::error || problem.kind == problem_kind_t::sink_unread) {
      reasons.push_back(std::move(problem.text));
    }
  }
  return reasons;
}

}  // namespace edid_cli
