#include "composition/library_line.h"

#include "text/text_lines.h"

namespace edid_cli {

std::string printed(const compose_log_line_t &line) {
  const std::string text = line.text;
  const std::string number = std::to_string(line.line);
  if (is_diagnostic(line)) {
    return line.module + (":" + number) + ":" + line.function + "() " + kind_of(line) + ": " + text + "\n";
  }
  if (line.kind == COMPOSE_LOG_TRACE) {
    return text + " \t\t\t" + line.function + "():" + number + "\n";
  }
  return text + "\n";
}

bool is_diagnostic(const compose_log_line_t &line) {
  return line.kind == COMPOSE_LOG_ERROR || line.kind == COMPOSE_LOG_WARNING || line.kind == COMPOSE_LOG_BUG;
}

std::string message_of(const compose_log_line_t &line) {
  // Texts of the platform stand in it as they are, and may have several lines.
  const std::string_view text = line.text;
  return std::string(trimmed(text.substr(0, text.find('\n'))));
}

const char *kind_of(const compose_log_line_t &line) {
  return line.kind == COMPOSE_LOG_ERROR ? "ERROR" : line.kind == COMPOSE_LOG_WARNING ? "WARNING" : "BUG";
}

}  // namespace edid_cli
