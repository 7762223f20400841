# "edid-composer explain": its sources, and the page that it writes explanations into.
set(explain_page_source ${CMAKE_CURRENT_BINARY_DIR}/explain_page_template.cpp)
set(embed_text ${PROJECT_SOURCE_DIR}/host/config_store/embed_text.cmake)
add_custom_command(
  OUTPUT ${explain_page_source}
  COMMAND ${CMAKE_COMMAND} -D INPUT=${CMAKE_CURRENT_LIST_DIR}/page.html -D OUTPUT=${explain_page_source} -D
          HEADER=explain/page_template.h -D NAMESPACE=edid_cli -D VARIABLE=explain_page_template -P ${embed_text}
  DEPENDS ${CMAKE_CURRENT_LIST_DIR}/page.html ${embed_text}
  COMMENT "Embedding the page of explanations"
  VERBATIM)

target_sources(
  edid_composer_cli
  PRIVATE ${CMAKE_CURRENT_LIST_DIR}/answer.cpp
          ${CMAKE_CURRENT_LIST_DIR}/audio_answer.cpp
          ${CMAKE_CURRENT_LIST_DIR}/base_block_bytes.cpp
          ${CMAKE_CURRENT_LIST_DIR}/byte_fields.cpp
          ${CMAKE_CURRENT_LIST_DIR}/byte_names.cpp
          ${CMAKE_CURRENT_LIST_DIR}/data_block_bytes.cpp
          ${CMAKE_CURRENT_LIST_DIR}/descriptor_bytes.cpp
          ${CMAKE_CURRENT_LIST_DIR}/explain_command.cpp
          ${CMAKE_CURRENT_LIST_DIR}/explained.cpp
          ${CMAKE_CURRENT_LIST_DIR}/explanation_json.cpp
          ${CMAKE_CURRENT_LIST_DIR}/explanation_page.cpp
          ${CMAKE_CURRENT_LIST_DIR}/explanation_text.cpp
          ${CMAKE_CURRENT_LIST_DIR}/hdmi_bytes.cpp
          ${CMAKE_CURRENT_LIST_DIR}/json_writer.cpp
          ${CMAKE_CURRENT_LIST_DIR}/mode_names.cpp
          ${CMAKE_CURRENT_LIST_DIR}/page_bytes.cpp
          ${CMAKE_CURRENT_LIST_DIR}/page_cards.cpp
          ${CMAKE_CURRENT_LIST_DIR}/page_decisions.cpp
          ${CMAKE_CURRENT_LIST_DIR}/platform_places.cpp
          ${CMAKE_CURRENT_LIST_DIR}/reason_table.cpp
          ${CMAKE_CURRENT_LIST_DIR}/reason_texts.cpp
          ${CMAKE_CURRENT_LIST_DIR}/rows.cpp
          ${CMAKE_CURRENT_LIST_DIR}/sources.cpp
          ${CMAKE_CURRENT_LIST_DIR}/steps.cpp
          ${CMAKE_CURRENT_LIST_DIR}/utf8_text.cpp
          ${CMAKE_CURRENT_LIST_DIR}/wanted.cpp
          ${explain_page_source})
target_include_directories(edid_composer_cli PRIVATE ${CMAKE_CURRENT_SOURCE_DIR})
