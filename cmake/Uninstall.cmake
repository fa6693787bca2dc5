# SPDX-License-Identifier: Apache-2.0
# Takes away what the last installation from this build tree put somewhere, and the folders of ours that are empty then.
if(NOT EXISTS install_manifest.txt)
  message(FATAL_ERROR "Nothing is installed from here: there is no install_manifest.txt.")
endif()

file(STRINGS install_manifest.txt FILES)
foreach(FILE ${FILES})
  file(REMOVE "$ENV{DESTDIR}${FILE}")
  cmake_path(GET FILE PARENT_PATH FOLDER)
  while(FOLDER MATCHES "/kelvasi(/Notices|/wireshark)?$")
    file(GLOB LEFT "$ENV{DESTDIR}${FOLDER}/*")
    if(NOT LEFT)
      file(REMOVE_RECURSE "$ENV{DESTDIR}${FOLDER}")
    endif()
    cmake_path(GET FOLDER PARENT_PATH FOLDER)
  endwhile()
endforeach()
file(REMOVE install_manifest.txt)
