#include "plain_record.h"

#include "support/records.h"

namespace properties {
namespace {

template <typename element_t>
void append_all(ll_list_t &list, const std::vector<element_t> &elements) {
  for (const element_t &element : elements)
    test_support::append(list, element);
}

template <typename element_t>
void add_entries(codec_test::fields_t &fields, const std::string &name, const std::vector<element_t> &elements) {
  for (std::size_t i = 0; i < elements.size(); ++i) {
    fields.merge(codec_test::prefixed(name + "[" + std::to_string(i) + "].", codec_test::fields_of(elements[i])));
  }
}

}  // namespace

void write_to(edid_t *edid, const plain_record_t &record) {
  // A list must stay where it was initialised: the four are put aside while the other fields are copied.
  const ll_list_t lists[] = {edid->std_timings, edid->dtd_list, edid->video_list, edid->audio_list};
  *edid = record.scalars;
  edid->std_timings = lists[0];
  edid->dtd_list = lists[1];
  edid->video_list = lists[2];
  edid->audio_list = lists[3];
  append_all(edid->std_timings, record.std_timings);
  append_all(edid->dtd_list, record.timings);
  append_all(edid->video_list, record.video);
  append_all(edid->audio_list, record.audio);
}

codec_test::fields_t fields_of(const plain_record_t &record) {
  codec_test::fields_t fields = codec_test::fields_of(record.scalars);
  add_entries(fields, "std_timings", record.std_timings);
  add_entries(fields, "dtd_list", record.timings);
  add_entries(fields, "video_list", record.video);
  add_entries(fields, "audio_list", record.audio);
  return fields;
}

}  // namespace properties
