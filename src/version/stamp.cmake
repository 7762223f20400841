# Writes OUTPUT from TEMPLATE with the date of the build, in the form of the date command. SOURCE_DATE_EPOCH makes it, and
# with it the build, reproducible.
set(format "+%a %b %e %H:%M:%S %Z %Y")
if(DEFINED ENV{SOURCE_DATE_EPOCH})
  set(moment --utc "--date=@$ENV{SOURCE_DATE_EPOCH}")
endif()
execute_process(
  COMMAND ${CMAKE_COMMAND} -E env LC_ALL=C date ${moment} ${format}
  OUTPUT_VARIABLE build_date
  OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
configure_file(${TEMPLATE} ${OUTPUT} @ONLY)
