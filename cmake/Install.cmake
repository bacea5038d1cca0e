# `cmake --install` and the Debian package. Program, module and libraries find each other by where they
# lie, so they stay together in a folder of their own; the command is a link to the program there.
include(GNUInstallDirs)
set(home ${CMAKE_INSTALL_LIBEXECDIR}/cliphost)

install(TARGETS cliphost RUNTIME DESTINATION ${home})
install(TARGETS NMAUtilLib20 aaf_library movie_library LIBRARY DESTINATION ${home})
install(TARGETS QuickTimePlugin LIBRARY DESTINATION ${home}/plugins)
install(DIRECTORY data/ DESTINATION ${home}/plugins FILES_MATCHING PATTERN "*.xml")
set_target_properties(cliphost NMAUtilLib20 aaf_library movie_library PROPERTIES INSTALL_RPATH "$ORIGIN")
set_target_properties(QuickTimePlugin PROPERTIES INSTALL_RPATH "$ORIGIN/..")
file(RELATIVE_PATH program /${CMAKE_INSTALL_BINDIR} /${home}/cliphost)
install(CODE "
  set(folder \"\$ENV{DESTDIR}\${CMAKE_INSTALL_PREFIX}/${CMAKE_INSTALL_BINDIR}\")
  file(MAKE_DIRECTORY \"\${folder}\")
  file(CREATE_LINK ${program} \"\${folder}/cliphost\" SYMBOLIC)")

# The program writes its manual pages and completions itself.
set(help ${PROJECT_BINARY_DIR}/help)
add_custom_command(OUTPUT ${help}/cliphost.1 COMMAND ${CMAKE_COMMAND} -E rm -rf ${help}
                   COMMAND cliphost --no-config help-files ${help} DEPENDS cliphost
                   VERBATIM)
add_custom_target(help_files ALL DEPENDS ${help}/cliphost.1)
install(DIRECTORY ${help}/ DESTINATION ${CMAKE_INSTALL_MANDIR}/man1 FILES_MATCHING PATTERN "*.1")
install(FILES ${help}/cliphost.bash RENAME cliphost
        DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
install(FILES ${help}/_cliphost DESTINATION ${CMAKE_INSTALL_DATADIR}/zsh/vendor-completions)
install(FILES ${help}/cliphost.fish DESTINATION ${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d)

# For modules and hosts of others.
set(headers ${CMAKE_INSTALL_INCLUDEDIR}/cliphost)
install(TARGETS host_interfaces FILE_SET HEADERS DESTINATION ${headers})
file(WRITE ${PROJECT_BINARY_DIR}/host_interfaces.pc "prefix=\${pcfiledir}/../..
includedir=\${prefix}/${headers}

Name: host_interfaces
Description: What crosses the border between a media-access host and its modules
Version: ${PROJECT_VERSION}
Cflags: -I\${includedir}
")
install(FILES ${PROJECT_BINARY_DIR}/host_interfaces.pc DESTINATION ${CMAKE_INSTALL_DATADIR}/pkgconfig)

install(FILES "cmake/cliphost-watch@.service" DESTINATION lib/systemd/system)

install(FILES LICENSE RENAME copyright DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/cliphost)
install(FILES README.md DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/cliphost)
install(DIRECTORY docs examples DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/cliphost)
install(PROGRAMS scripts/cluster/describe.sbatch scripts/cluster/describe_ssh.sh
        DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/cliphost/cluster)

set(CPACK_PACKAGE_NAME cliphost)
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGE_CONTACT "The Cliphost authors <cliphost@localhost>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "describe movies of the QuickTime family as AAF files")
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION video)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${PROJECT_BINARY_DIR})
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
include(CPack)
