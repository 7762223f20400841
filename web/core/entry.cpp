// What the page's worker calls.
#include <emscripten/emscripten.h>

#include <exception>
#include <string>

#include "io/bad_input.h"
#include "operations.h"
#include "text/utf8_text.h"

namespace {

/// A request that could not be served, in one sentence. What is wrong with a part of it is said with the others.
std::string failure(const char *what) {
  return edid_web::json_t{{"error", edid_cli::valid_utf8(what)}}.dump();
}

std::string answer_to(std::string_view request, std::string_view content) {
  try {
    return edid_web::run_operation(edid_web::json_t::parse(request), content);
  } catch (const std::exception &problem) {
    return failure(problem.what());
  }
}

}  // namespace

/// Returns a JSON document, NUL-terminated, valid until the next call.
extern "C" EMSCRIPTEN_KEEPALIVE const char *edid_web_run(const char *request, std::size_t request_size,
                                                         const char *content, std::size_t content_size) {
  static std::string document;
  document = answer_to({request, request_size}, {content, content_size});
  return document.c_str();
}
