# The completion scripts and the manual pages, generated at build time by the
# built orvixcli from its own command tree (after the plug-in is built), so
# they always match the commands they describe. The build tree holds them in
# the install layout:
#   share/bash-completion/completions/orvixcli, share/zsh/vendor-completions/_orvixcli,
#   share/man/man8/*.8 (plain, for man -l and groff), and the gzipped copies
#   that are installed (gzip -9n: no name or time stamp, so builds agree).
include(GNUInstallDirs)

set(ORVIX_MAN_DIR ${CMAKE_BINARY_DIR}/share/man/man8)
set(ORVIX_MAN_GZ_DIR ${CMAKE_BINARY_DIR}/docs/man8)
set(ORVIX_BASH_COMPLETION ${CMAKE_BINARY_DIR}/share/bash-completion/completions/orvixcli)
set(ORVIX_ZSH_COMPLETION ${CMAKE_BINARY_DIR}/share/zsh/vendor-completions/_orvixcli)
set(ORVIX_DOCS_STAMP ${CMAKE_BINARY_DIR}/docs/generated.stamp)
# The pages' date: SOURCE_DATE_EPOCH when set (reproducible builds), else today.
string(TIMESTAMP ORVIX_MAN_DATE "%Y-%m-%d" UTC)

add_custom_command(
  OUTPUT ${ORVIX_DOCS_STAMP} ${ORVIX_BASH_COMPLETION} ${ORVIX_ZSH_COMPLETION}
  COMMAND ${CMAKE_COMMAND} -E rm -rf ${ORVIX_MAN_DIR} ${ORVIX_MAN_GZ_DIR}
  COMMAND ${CMAKE_COMMAND} -E make_directory ${ORVIX_MAN_DIR} ${ORVIX_MAN_GZ_DIR}
          ${CMAKE_BINARY_DIR}/share/bash-completion/completions ${CMAKE_BINARY_DIR}/share/zsh/vendor-completions
  COMMAND $<TARGET_FILE:orvixcli> __manpages ${ORVIX_MAN_DIR} ${ORVIX_MAN_DATE}
  # orvix-hostsim's page is written by hand; it is checked and installed
  # with the generated ones.
  COMMAND ${CMAKE_COMMAND} -E copy ${PROJECT_SOURCE_DIR}/docs/man/orvix-hostsim.8 ${ORVIX_MAN_DIR}/
  COMMAND sh -c "for page in \"$1\"/*.8; do gzip -9n <\"$page\" >\"$2/\${page##*/}.gz\" || exit 1; done"
          sh ${ORVIX_MAN_DIR} ${ORVIX_MAN_GZ_DIR}
  COMMAND sh -c "\"$1\" --completion bash >\"$2\" && \"$1\" --completion zsh >\"$3\""
          sh $<TARGET_FILE:orvixcli> ${ORVIX_BASH_COMPLETION} ${ORVIX_ZSH_COMPLETION}
  COMMAND ${CMAKE_COMMAND} -E touch ${ORVIX_DOCS_STAMP}
  DEPENDS orvixcli orvix_network_plugin ${PROJECT_SOURCE_DIR}/docs/man/orvix-hostsim.8
  COMMENT "Generating the manual pages and completion scripts"
  VERBATIM)
add_custom_target(orvix_docs ALL DEPENDS ${ORVIX_DOCS_STAMP})

install(DIRECTORY ${ORVIX_MAN_GZ_DIR}/ DESTINATION ${CMAKE_INSTALL_MANDIR}/man8 FILES_MATCHING PATTERN "*.8.gz")
install(FILES ${ORVIX_BASH_COMPLETION} DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
install(FILES ${ORVIX_ZSH_COMPLETION} DESTINATION ${CMAKE_INSTALL_DATADIR}/zsh/vendor-completions)

if(ORVIX_BUILD_TESTS)
  # Real shells complete real command lines against a fixture host; groff
  # and man read every page.
  add_test(NAME ShellCompletion
           COMMAND ${PROJECT_SOURCE_DIR}/tests/shell/completion.sh ${CMAKE_BINARY_DIR}
                   ${PROJECT_SOURCE_DIR}/profiles/default.json)
  add_test(NAME ManualPages COMMAND ${PROJECT_SOURCE_DIR}/tests/shell/manpages.sh ${CMAKE_BINARY_DIR})
  set_tests_properties(ShellCompletion ManualPages PROPERTIES TIMEOUT 120)
endif()
