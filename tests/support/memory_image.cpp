#include "support/memory_image.h"

namespace test_support {

namespace {

/// An entry without its payload and its padding, which nobody has to initialise.
std::string image_of_links(const ll_entry_t &entry) {
  return image_of(entry.data) + image_of(entry.next) + image_of(entry.list) + image_of(entry.type);
}

}  // namespace

std::string image_of_entries(const ll_list_t &list, std::size_t payload_size) {
  std::string image;
  for (const ll_entry_t *entry = list.head; entry != nullptr; entry = entry->next) {
    image += image_of_links(*entry);
    image.append(static_cast<const char *>(entry->data), payload_size);
  }
  return image;
}

namespace {

/// As image_of_entries(), but for the padding of the payloads, which nobody has to initialise.
std::string image_of_modes(const ll_list_t &list) {
  std::string image;
  for (const ll_entry_t *entry = list.head; entry != nullptr; entry = entry->next) {
    const auto &mode = *static_cast<const short_video_desc_t *>(entry->data);
    image += image_of_links(*entry) + image_of(mode.native) + image_of(mode.vic) + image_of(mode.stereo);
  }
  return image;
}

}  // namespace

std::string image_of_all(const platform_values_t &values) {
  std::string image = image_of(values) + image_of_entries(values.audio_list, sizeof(i32));
  for (const ll_list_t *list : {&values.video_50_priority, &values.video_50_additional, &values.video_60_priority,
                                &values.video_60_additional}) {
    image += image_of_modes(*list);
  }
  return image + image_of_entries(values.std_timings, sizeof(std_timing_t));
}

}  // namespace test_support
