// EDIDs in the layouts that other tools write.
#include <cstdio>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

constexpr std::size_t row_size = 16;

std::string offset_text(const char *format, std::size_t offset) {
  char text[16];
  std::snprintf(text, sizeof text, format, static_cast<unsigned>(offset));
  return text;
}

std::string characters_of(const std::string &bytes) {
  std::string text;
  for (const char byte : bytes) {
    text += byte >= 0x20 && byte < 0x7F ? byte : '.';
  }
  return text;
}

/// "00000000: 00ff ffff ffff ff00 ...  ......"
std::string xxd_dump(const std::string &bytes, std::size_t group_size) {
  std::string dump;
  for (std::size_t offset = 0; offset < bytes.size(); offset += row_size) {
    const std::string row = bytes.substr(offset, row_size);
    dump += offset_text("%08x:", offset);
    for (std::size_t at = 0; at < row.size(); at += group_size) {
      dump += " " + hex_of(row.substr(at, group_size), "");
    }
    dump += "  " + characters_of(row) + "\n";
  }
  return dump;
}

/// With an offset in front of each row, and "*" for rows like the one before.
std::string squeezed_dump(const std::string &bytes, const char *format, bool has_text_column) {
  std::string dump;
  bool is_squeezing = false;
  for (std::size_t offset = 0; offset < bytes.size(); offset += row_size) {
    const std::string row = bytes.substr(offset, row_size);
    if (offset > 0 && row == bytes.substr(offset - row_size, row_size)) {
      dump += is_squeezing ? "" : "*\n";
      is_squeezing = true;
      continue;
    }
    is_squeezing = false;
    dump += offset_text(format, offset) + "  " + hex_of(row.substr(0, 8)) + "  " + hex_of(row.substr(8));
    dump += has_text_column ? "  |" + characters_of(row) + "|\n" : "\n";
  }
  return dump + offset_text(format, bytes.size()) + "\n";
}

std::string rows_of(const std::string &bytes, const std::string &indentation, const std::string &separator) {
  std::string rows;
  for (std::size_t offset = 0; offset < bytes.size(); offset += row_size) {
    rows += indentation + hex_of(bytes.substr(offset, row_size), separator) + "\n";
  }
  return rows;
}

std::string decoding_tools_text(const std::string &bytes) {
  return "edid-decode (hex):\n\n" + rows_of(bytes.substr(0, 128), "", " ") + "\n" +
         rows_of(bytes.substr(128), "", " ") +
         "\n----------------\n\nBlock 0, Base EDID:\n  EDID Structure Version: 1.3\n";
}

std::string output_properties(const std::string &bytes) {
  return "Screen 0: minimum 8 x 8, current 1920 x 1080\nHDMI-1 connected 1920x1080+0+0 (normal left) 1210mm x 680mm\n"
         "\tEDID: \n" +
         rows_of(bytes, "\t\t", "") +
         "\tBroadcast RGB: Automatic \n\t\tsupported: Automatic, Full\n   1920x1080 60.00*+\n";
}

std::string rows_of_numbers(const std::string &bytes) {
  return "  0x" + [&bytes] {
    std::string numbers = hex_of(bytes, ", 0x");
    for (std::size_t at = 0, count = 0; (at = numbers.find(", ", at)) != std::string::npos; ++at) {
      numbers.replace(at, 2, ++count % row_size == 0 ? ",\n" : ", ");
    }
    return numbers;
  }() + ",\n";
}

/// As the registry's editor writes it, 16 bytes a line.
std::string registry_text(const std::string &bytes) {
  std::string text = "Windows Registry Editor Version 5.00\r\n\r\n[HKEY_LOCAL_MACHINE\\DISPLAY]\r\n\"EDID\"=hex:";
  for (std::size_t offset = 0; offset < bytes.size(); offset += row_size) {
    text += (offset == 0 ? "" : ",\\\r\n  ") + hex_of(bytes.substr(offset, row_size), ",");
  }
  return text + "\r\n\r\n";
}

class EdidLayouts : public cli_fixture_t {
 protected:
  process_result_t print(const std::string &content) { return run_cli({"print", directory_.write("edid", content)}); }

  void expect_same_as_raw(const std::string &content) {
    const process_result_t result = print(content);
    EXPECT_EQ(result.status, 0) << content;
    EXPECT_EQ(result.error, "");
    EXPECT_EQ(result.output, print(bytes_).output) << content;
  }

  std::string path() const { return directory_.path("edid"); }

  const std::string bytes_ = sample_bytes("tv_4k");
};

TEST_F(EdidLayouts, OffsetsWithAColonAndATextColumnThatLooksLikeDigits) {
  for (const std::size_t group_size : {1U, 2U, 4U}) {
    expect_same_as_raw(xxd_dump(bytes_, group_size));
  }
  std::string dump = xxd_dump(bytes_, 2);
  dump.replace(dump.find("  .") + 2, 16, "00ff 00ff 00ff 0");
  expect_same_as_raw(dump);
}

TEST_F(EdidLayouts, OffsetsWithAFramedTextColumn) {
  expect_same_as_raw(squeezed_dump(bytes_, "%08x", true));
}

TEST_F(EdidLayouts, OffsetsInEachRadix) {
  for (const char *format : {"%06x", "%07o", "%07u", "%08X"}) {
    expect_same_as_raw(squeezed_dump(bytes_, format, false));
  }
}

TEST_F(EdidLayouts, RowsThatADumpLeavesOutAreRepeated) {
  std::string bytes = bytes_.substr(0, 128) + std::string("\x02\x03\x04\0", 4) + std::string(124, '\0');
  bytes.back() = static_cast<char>(-9);
  const std::string dump = squeezed_dump(bytes, "%08x", true);
  ASSERT_NE(dump.find("\n*\n"), std::string::npos);
  const process_result_t result = print(dump);
  EXPECT_EQ(result.status, 0) << result.error;
  EXPECT_EQ(result.output, print(bytes).output);
}

TEST_F(EdidLayouts, TheBlockThatADecoderPrintsFirst) {
  expect_same_as_raw(decoding_tools_text(bytes_));
}

TEST_F(EdidLayouts, ThePropertyOfAnOutput) {
  expect_same_as_raw(output_properties(bytes_));
  std::string old = output_properties(bytes_);
  expect_same_as_raw(old.replace(old.find("EDID:"), 5, "EDID_DATA:"));
}

TEST_F(EdidLayouts, LinesThatEndAsOnOtherSystems) {
  for (std::string text : {output_properties(bytes_), squeezed_dump(bytes_, "%08x", true), xxd_dump(bytes_, 2)}) {
    for (std::size_t at = 0; (at = text.find('\n', at)) != std::string::npos; at += 2) {
      text.insert(at, "\r");
    }
    expect_same_as_raw(text);
  }
}

TEST_F(EdidLayouts, ADigitThatIsNoneIsNamedWithItsPlace) {
  std::string dump = xxd_dump(bytes_, 2);
  dump.replace(dump.find("\n00000010: ") + 11, 2, "g0");
  expect_bad_input(print(dump), path() + ":2:11: \"" + dump.substr(dump.find("g0"), 4) + "\" is not hexadecimal");
  const std::string row = hex_of(bytes_.substr(32, row_size), "");
  std::string property = output_properties(bytes_);
  property.replace(property.find(row), 1, "x");
  expect_bad_input(print(property), path() + ":6:3: \"x" + row.substr(1) + "\" is not hexadecimal");
}

TEST_F(EdidLayouts, AnOffsetThatDoesNotFollowIsNamedWithItsPlace) {
  std::string dump = xxd_dump(bytes_, 2);
  dump.erase(dump.find("00000020:"), dump.find("00000030:") - dump.find("00000020:"));
  expect_bad_input(print(dump),
                   path() + ":3:1: \"00000030\" is not the offset of what follows: 32 bytes come before it");
  expect_bad_input(print("00000000  00 ff\n*\nffffffff\n"),
                   path() + ":3:1: \"ffffffff\" is not the offset of what follows: 2 bytes come before it");
  expect_bad_input(print("00000000  00 ff\n*\n"), path() + ":2:1: \"*\" is followed by no offset that ends it");
  expect_bad_input(print("00000000  00 ff\nnot an offset\n"),
                   path() + ":2:1: \"not\" is not the offset that a line of this dump begins with");
}

TEST_F(EdidLayouts, WordsOfTwoBytesHaveNoOrderAndAreRefused) {
  expect_bad_input(print("0000000 ff00 ffff ffff 00ff\n"),
                   path() + ":1:9: \"ff00\" is not one byte; dump with xxd or hexdump -C");
}

TEST_F(EdidLayouts, AnArrayInC) {
  const std::string array = "#include <stdint.h>\n/* A television: {00} */\nstatic const uint8_t edid[256] = {\n" +
                            rows_of_numbers(bytes_) + "};  // 0xFF\n";
  expect_same_as_raw(array);
  expect_same_as_raw("unsigned char edid[][128] = {{\n" + rows_of_numbers(bytes_.substr(0, 128)) + "}, {\n" +
                     rows_of_numbers(bytes_.substr(128)) + "}};");
  std::string decimal;
  for (const char byte : bytes_) {
    decimal += std::to_string(static_cast<unsigned char>(byte)) + ",";
  }
  expect_same_as_raw("{" + decimal + "}");
}

TEST_F(EdidLayouts, WhatIsWrongInAnArrayIsNamedWithItsPlace) {
  expect_bad_input(print("u8 e[] = {\n0x00, 0x100\n};\n"), path() + ":2:7: \"0x100\" is not a number from 0 to 255");
  expect_bad_input(print("u8 e[] = { EDID };"), path() + ":1:12: \"EDID\" is not a number from 0 to 255");
  expect_bad_input(print("u8 e[] = {0};\nu8 f[] = {0};"),
                   path() + ":2:10: \"{\" begins a second array; the first is at line 1. Leave one of them");
  expect_bad_input(print("\nu8 e[] = { 0,"), path() + ": the array that begins at line 2 has no closing brace");
}

TEST_F(EdidLayouts, AValueOfTheRegistry) {
  const std::string text = registry_text(bytes_);
  expect_same_as_raw(text);
  expect_same_as_raw("\xEF\xBB\xBF" + text);
  std::string utf16 = "\xFF\xFE";
  for (const char character : text) {
    utf16 += {character, '\0'};
  }
  expect_same_as_raw(utf16);
}

TEST_F(EdidLayouts, WhatIsWrongInTheRegistryIsNamedWithItsPlace) {
  const std::string text = registry_text(bytes_);
  expect_bad_input(print("REGEDIT4\n\n[HKEY]\n\"Other\"=hex:00\n"),
                   path() + ": no value \"EDID\"=hex:... in this part of the registry");
  expect_bad_input(print(text + text), path() + ":24: a second EDID; the first is at line 4. Leave one of them");
  expect_bad_input(print("REGEDIT4\n\"EDID\"=hex:00,zz\n"), path() + ":2:15: \"zz\" is not hexadecimal");
}

TEST_F(EdidLayouts, AByteOrderMarkBeforeDigits) {
  expect_same_as_raw("\xEF\xBB\xBF" + rows_of(bytes_, "", " "));
}

TEST_F(EdidLayouts, ARawDumpWithANewlineAfterIt) {
  expect_same_as_raw(bytes_ + "\n");
  expect_same_as_raw(bytes_ + "\r\n");
  expect_bad_input(print(bytes_ + "\n\n"),
                   path() + ": 258 bytes are not an EDID, which has 1 to 256 blocks of 128 bytes");
}

TEST_F(EdidLayouts, OfTwoDisplaysNoneIsChosen) {
  const std::string text = output_properties(bytes_);
  expect_bad_input(print(text + text), path() + ":25: a second EDID; the first is at line 3. Leave one of them");
}

TEST_F(EdidLayouts, AHeadingWithoutABlockIsRefused) {
  expect_bad_input(print("DP-1 connected\n\tEDID: \n\tnon-desktop: 0\n"), path() + ":2: no hexadecimal digits follow");
}

}  // namespace
}  // namespace host_test
