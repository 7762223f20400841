// A host with several inputs, on the embedded configuration store: composes once for each display that is plugged in,
// and makes the EDIDs of all its inputs of that by patching the physical address.
//
//   hotplug_host PLATFORM INPUTS FOLDER EVENT...
//
// The events happen in their order: the name of a file with a display's EDID (plugged in), `-` (unplugged), or
// `--platform FILE` (another configuration). What event 3 makes input 0 show is written to FOLDER/3.input0.bin, where a
// product writes it to the EDID memory of the input.
//
// Three threads, and what each may call:
//
//   event thread      (main) sees hot-plug; must not wait. Of the library it may call everything, but it leaves what
//   takes
//                     time to the composing thread. debug_enable() may be called here at any time.
//   composing thread  compose_edid(), which calls the store's config_* operations, and config_store_load_file(), which
//   must
//                     not run at the same time as those: with both on one thread it cannot.
//   CEC thread        wants the address of an input. It reads what is shown, never what is being composed; here it asks
//                     once, when all is done.
#include <config_store.h>
#include <edid_composer.h>

#include <array>
#include <condition_variable>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <mutex>
#include <queue>
#include <string>
#include <thread>
#include <utility>
#include <vector>

namespace {

constexpr unsigned most_inputs = 15;
constexpr unsigned no_address = 0xFFFF;
constexpr u32 edid_size = 256;
constexpr u32 block_size = 128;

using edid_bytes_t = std::array<u8, edid_size>;

// ---- Patching
// --------------------------------------------------------------------------------------------------------

unsigned address_at(const edid_bytes_t &edid, u8 spa_offset) {
  return static_cast<unsigned>(edid[spa_offset] << 8 | edid[spa_offset + 1]);
}

// The sum of a block's bytes is 0, modulo 256.
void mend_extension_checksum(edid_bytes_t *edid) {
  unsigned sum = 0;
  for (u32 i = block_size; i < edid_size - 1; ++i)
    sum += (*edid)[i];
  edid->back() = static_cast<u8>(0x100 - sum % 0x100);
}

// Makes the EDID of input 0 that of another input. An input's number, counted from 1, is the last level in use of its
// address: 2.1.0.0 is input 0 of a box at 2.0.0.0, and 2.3.0.0 its input 2. Without an address, all inputs show the
// same.
void patch_for_input(edid_bytes_t *edid, u8 spa_offset, unsigned input) {
  const unsigned address = address_at(*edid, spa_offset);
  if (address == no_address) return;
  unsigned shift = 0;
  while (shift < 12 && (address >> shift & 0xF) == 0)
    shift += 4;
  // The address f.f.f.f means none: input 14 of a box at f.f.f.0 has no address left. Composing gives the same.
  const unsigned patched = (address & ~(0xFu << shift)) | (input + 1) << shift;
  (*edid)[spa_offset] = static_cast<u8>(patched >> 8);
  (*edid)[spa_offset + 1] = static_cast<u8>(patched);
  mend_extension_checksum(edid);
}

// ---- What the inputs show: written by the composing thread, read by any
// ----------------------------------------------

class shown_edids_t {
 public:
  explicit shown_edids_t(unsigned inputs) : addresses_(inputs, no_address) {}

  void show(unsigned input, unsigned address) {
    const std::lock_guard lock(mutex_);
    addresses_[input] = address;
  }

  unsigned address_of(unsigned input) const {
    const std::lock_guard lock(mutex_);
    return addresses_[input];
  }

  unsigned inputs() const { return static_cast<unsigned>(addresses_.size()); }

 private:
  mutable std::mutex mutex_;
  std::vector<unsigned> addresses_;
};

// ---- Events: from the event thread to the composing thread
// -----------------------------------------------------------

struct event_t {
  enum class kind_t { plugged, unplugged, platform, end } kind;
  std::string path;
};

class event_queue_t {
 public:
  void put(event_t event) {
    {
      const std::lock_guard lock(mutex_);
      events_.push(std::move(event));
    }
    arrived_.notify_one();
  }

  event_t take() {
    std::unique_lock lock(mutex_);
    arrived_.wait(lock, [this] { return !events_.empty(); });
    event_t event = std::move(events_.front());
    events_.pop();
    return event;
  }

 private:
  std::mutex mutex_;
  std::condition_variable arrived_;
  std::queue<event_t> events_;
};

// ---- The composing thread
// --------------------------------------------------------------------------------------------

class composing_thread_t {
 public:
  composing_thread_t(event_queue_t *events, shown_edids_t *shown, std::string folder)
      : events_(events), shown_(shown), folder_(std::move(folder)) {}

  void operator()() {
    for (unsigned number = 1;; ++number) {
      const event_t event = events_->take();
      if (event.kind == event_t::kind_t::end) return;
      if (event.kind == event_t::kind_t::platform) {
        // A file that is refused leaves the configuration as it was.
        if (!config_store_load_file(event.path.c_str())) fail(config_store_error());
      } else {
        display_changed(number, event);
      }
    }
  }

  bool all_is_well() const { return failures_ == 0; }  // To be asked when the thread has ended.

 private:
  void display_changed(unsigned number, const event_t &event) {
    std::vector<char> sink;
    if (event.kind == event_t::kind_t::plugged) {
      // As over DDC: what could be read is handed over as it is, and nothing at all if nothing could.
      std::ifstream file(event.path, std::ios::binary);
      sink.assign(std::istreambuf_iterator<char>(file), {});
    }
    u8 spa_offset = 0;
    compose_cfg_t settings{};
    settings.audio_mask = 0xFFFFFFFF;
    settings.hdmi_3d_mode = 1;
    settings.spa_offset = &spa_offset;
    const u8 *const bytes = sink.empty() ? nullptr : reinterpret_cast<const u8 *>(sink.data());
    edid_bytes_t composed{};
    if (!compose_edid(bytes, static_cast<u32>(sink.size()), composed.data(), edid_size, &settings)) {
      fail("nothing composed; the inputs go on showing what they showed");
      return;
    }
    for (unsigned input = 0; input < shown_->inputs(); ++input) {
      edid_bytes_t patched = composed;
      patch_for_input(&patched, spa_offset, input);
      show(number, input, patched, spa_offset);
    }
  }

  // A product drives the input's hot-plug line low for 100 ms or more while it writes.
  void show(unsigned number, unsigned input, const edid_bytes_t &edid, u8 spa_offset) {
    const std::string path = folder_ + "/" + std::to_string(number) + ".input" + std::to_string(input) + ".bin";
    std::ofstream file(path, std::ios::binary);
    file.write(reinterpret_cast<const char *>(edid.data()), edid_size);
    if (!file.flush()) {
      fail(path + ": cannot be written");
      return;
    }
    shown_->show(input, address_at(edid, spa_offset));
  }

  void fail(const std::string &message) {
    std::fprintf(stderr, "hotplug_host: %s\n", message.c_str());
    ++failures_;
  }

  event_queue_t *events_;
  shown_edids_t *shown_;
  std::string folder_;
  unsigned failures_ = 0;
};

// ---- The event thread
// ------------------------------------------------------------------------------------------------

bool post_events(int argc, char **argv, int first, event_queue_t *events) {
  for (int i = first; i < argc; ++i) {
    const std::string word = argv[i];
    if (word == "--platform") {
      if (++i == argc) return false;
      events->put({event_t::kind_t::platform, argv[i]});
    } else if (word == "-") {
      events->put({event_t::kind_t::unplugged, ""});
    } else {
      events->put({event_t::kind_t::plugged, word});
    }
  }
  return true;
}

void print_addresses(const shown_edids_t &shown) {
  for (unsigned input = 0; input < shown.inputs(); ++input) {
    const unsigned address = shown.address_of(input);
    std::printf("input %u: %x.%x.%x.%x\n", input, address >> 12, address >> 8 & 0xF, address >> 4 & 0xF, address & 0xF);
  }
}

int usage() {
  std::fprintf(stderr,
               "usage: hotplug_host PLATFORM INPUTS FOLDER EVENT...\n"
               "  an EVENT is the file of a display's EDID, - for none, or --platform FILE\n");
  return 2;
}

}  // namespace

int main(int argc, char **argv) {
  if (argc < 5) return usage();
  const unsigned long inputs = std::strtoul(argv[2], nullptr, 10);
  if (inputs < 1 || inputs > most_inputs) return usage();
  std::setvbuf(stdout, nullptr, _IOLBF, BUFSIZ);  // The library's lines come when they are written, also into a file.
  if (!config_store_load_file(argv[1])) {
    std::fprintf(stderr, "hotplug_host: %s\n", config_store_error());
    return 1;
  }

  event_queue_t events;
  shown_edids_t shown(static_cast<unsigned>(inputs));
  composing_thread_t composing(&events, &shown, argv[3]);
  std::thread thread([&composing] { composing(); });
  const bool understood = post_events(argc, argv, 4, &events);
  events.put({event_t::kind_t::end, ""});
  thread.join();
  if (!understood) return usage();

  std::thread cec_thread([&shown] { print_addresses(shown); });
  cec_thread.join();
  return composing.all_is_well() ? 0 : 1;
}
