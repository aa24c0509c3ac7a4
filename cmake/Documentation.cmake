# SPDX-License-Identifier: Apache-2.0
# The target `docs`: the interface's reference pages, where Doxygen is installed. A test makes them too, and fails if
# Doxygen has anything to say about them.

find_package(Doxygen QUIET)
if(DOXYGEN_FOUND)
    get_target_property(public_headers EditorModel HEADER_SET)
    list(JOIN public_headers "\" \"" documented_headers)
    configure_file(docs/Doxyfile.in Doxyfile @ONLY)
    add_custom_target(docs
        COMMAND Doxygen::doxygen "${CMAKE_CURRENT_BINARY_DIR}/Doxyfile"
        COMMENT "Writing the reference pages to ${CMAKE_CURRENT_BINARY_DIR}/docs/html"
        VERBATIM)
    if(EDITORMODEL_BUILD_TESTS)
        add_test(NAME House.ReferencePagesAreMadeWithoutWarnings
            COMMAND Doxygen::doxygen "${CMAKE_CURRENT_BINARY_DIR}/Doxyfile")
    endif()
endif()
