// The names of a mask's bits, written into a caller's buffer.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer.h"
#include "utility/utility_lines.h"

namespace utility_tests {
namespace {

/// What a formatter left in a buffer of exactly the given size, and what it answered.
struct formatted_t {
  std::vector<char> buffer;
  int result;

  std::string text() const { return std::string(buffer.data(), strnlen(buffer.data(), buffer.size())); }
};

/// Both formatters make the same steps.
struct formatter_t {
  const char *name;
  int (*format)(u32 mask, char *string, u32 string_len);
  const char *text_of_nothing;
  u32 named_bits;
  const char *text_of_all;

  formatted_t operator()(u32 mask, u32 size) const {
    formatted_t formatted{std::vector<char>(size, '\x55'), -1};
    formatted.result = format(mask, formatted.buffer.data(), size);
    return formatted;
  }
};

std::ostream &operator<<(std::ostream &out, const formatter_t &formatter) {
  return out << formatter.name;
}

class MaskFormatter : public testing::TestWithParam<formatter_t> {};

TEST_P(MaskFormatter, NamesAllBitsInOrderEachFollowedByABlank) {
  const formatted_t formatted = GetParam()(GetParam().named_bits, 100);
  EXPECT_EQ(formatted.text(), GetParam().text_of_all);
  EXPECT_EQ(formatted.result, static_cast<int>(formatted.text().size()));
}

TEST_P(MaskFormatter, ClearsTheBufferBehindTheText) {
  const formatted_t formatted = GetParam()(0, 40);
  EXPECT_EQ(std::string(formatted.buffer.data(), 40), GetParam().text_of_nothing + std::string(24, '\0'));
}

TEST_P(MaskFormatter, HasATextForTheEmptyMaskThatJustFitsTheMinimum) {
  const formatted_t formatted = GetParam()(0, 17);
  EXPECT_EQ(formatted.text(), GetParam().text_of_nothing);
  EXPECT_EQ(formatted.result, 16);
}

TEST_P(MaskFormatter, IgnoresHigherBits) {
  const formatted_t others_only = GetParam()(~GetParam().named_bits, 20);
  EXPECT_EQ(others_only.text(), "");
  EXPECT_EQ(others_only.result, 0);
  EXPECT_EQ(GetParam()(0xFFFFFFFF, 100).text(), GetParam().text_of_all);
}

TEST_P(MaskFormatter, CutsTheTextAndAnswersItsWholeLength) {
  const std::string whole = GetParam().text_of_all;
  for (const u32 size : {17u, static_cast<u32>(whole.size()), static_cast<u32>(whole.size()) + 1}) {
    const formatted_t formatted = GetParam()(GetParam().named_bits, size);
    EXPECT_EQ(formatted.text(), whole.substr(0, size - 1)) << size;
    EXPECT_EQ(formatted.result, static_cast<int>(whole.size())) << size;
    EXPECT_EQ(formatted.buffer.back(), '\0') << size;
  }
}

TEST_P(MaskFormatter, RefusesShortBuffersAndLeavesThemCleared) {
  for (const u32 size : {1u, 16u}) {
    formatted_t formatted{};
    EXPECT_EQ(output_of([&] { formatted = GetParam()(GetParam().named_bits, size); }),
              error(GetParam().name, "\"string_len\" invalid. string_len:" + std::to_string(size) + " minimum:17"));
    EXPECT_EQ(formatted.buffer, std::vector<char>(size, '\0'));
    EXPECT_EQ(formatted.result, 0);
  }
}

TEST_P(MaskFormatter, RefusesAnEmptyBufferAndTouchesNothing) {
  char byte = 'x';
  EXPECT_EQ(output_of([&] { EXPECT_EQ(GetParam().format(1, &byte, 0), 0); }),
            error(GetParam().name, "\"string_len\" invalid. string_len:0 minimum:17"));
  EXPECT_EQ(byte, 'x');
}

TEST_P(MaskFormatter, ReportsANullBufferBeforeAShortOne) {
  EXPECT_EQ(output_of([] {
              EXPECT_EQ(GetParam().format(1, nullptr, 0), 0);
              EXPECT_EQ(GetParam().format(1, nullptr, 100), 0);
            }),
            error(GetParam().name, "\"string\" parameter is NULL. string:(nil)") +
                error(GetParam().name, "\"string\" parameter is NULL. string:(nil)"));
}

INSTANTIATE_TEST_SUITE_P(Masks, MaskFormatter,
                         testing::Values(formatter_t{"audio_freq_string", audio_freq_string, " NoFreqSpecified", 0x7F,
                                                     "32kHz 44.1kHz 48kHz 88.2kHz 96kHz 176.4kHz 192kHz "},
                                         formatter_t{"audio_pcm_bits_string", audio_pcm_bits_string, " NoBitsSpecified",
                                                     7, "16bits 20bits 24bits "}),
                         [](const testing::TestParamInfo<formatter_t> &tested) {
                           return std::string(tested.param.name);
                         });

TEST(AudioFreqString, NamesEachBit) {
  const char *const names[] = {"32kHz ", "44.1kHz ", "48kHz ", "88.2kHz ", "96kHz ", "176.4kHz ", "192kHz "};
  for (u32 bit = 0; bit < 7; ++bit) {
    char text[20];
    audio_freq_string(1u << bit, text, sizeof(text));
    EXPECT_STREQ(text, names[bit]);
  }
}

TEST(AudioPcmBitsString, NamesEachBit) {
  const char *const names[] = {"16bits ", "20bits ", "24bits "};
  for (u32 bit = 0; bit < 3; ++bit) {
    char text[20];
    audio_pcm_bits_string(1u << bit, text, sizeof(text));
    EXPECT_STREQ(text, names[bit]);
  }
}

}  // namespace
}  // namespace utility_tests
