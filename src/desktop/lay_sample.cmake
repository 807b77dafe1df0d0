# Lays the sample season beside the program, open and with its night picked, unless something has been
# opened there before. What lies there already stays as it is.
get_filename_component(prefix "${CMAKE_INSTALL_PREFIX}" ABSOLUTE)
set(place "$ENV{DESTDIR}${prefix}")
if(NOT EXISTS "${place}/FileName.qz3" AND NOT EXISTS "${place}/Winter.qza"
   AND EXISTS "${samples}/Winter.qza")
  file(GLOB season "${samples}/Winter*" "${samples}/*.qz3")
  foreach(file IN LISTS season)
    get_filename_component(name "${file}" NAME)
    if(NOT EXISTS "${place}/${name}")
      file(COPY "${file}" DESTINATION "${place}" NO_SOURCE_PERMISSIONS)
    endif()
  endforeach()
  # Side files are not written in UTF-8: a path beyond ASCII is left to the working folder.
  set(path "${prefix}/Winter.qza")
  if(NOT path MATCHES "^[ -~]*$")
    set(path "Winter.qza")
  endif()
  file(WRITE "${place}/FileName.qz3" "\"${path}\"\r\n")
endif()
