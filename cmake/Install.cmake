# `cmake --install BUILD --prefix DIR` gives a working orvixcli under DIR:
#   bin/orvixcli, bin/orvix-hostsim
#   lib/orvixcli/liborvix_*.so            the libraries, private to orvixcli
#   lib/orvixcli/plugins/network.so       the plug-in folder
#   share/orvixcli/profiles/default.json  the default host, for `init --profile`
#   share/doc/orvixcli/                   README, the documents, copyright
# The build tree keeps its libraries in lib/ beside lib/orvixcli/plugins; an
# installation keeps them in a folder of their own, so that a system
# installation under /usr puts nothing in the shared library folder. Run
# paths are relative ($ORIGIN), so an installation can be moved, and every
# one of them points into lib/orvixcli only. The CLI finds its plug-ins
# beside its own folder in both layouts (cli/PluginLoader.cpp).
set(ORVIX_INSTALL_LIBDIR lib/orvixcli)
set(ORVIX_INSTALL_PLUGINDIR ${ORVIX_INSTALL_LIBDIR}/plugins)
set(ORVIX_INSTALL_DATADIR share/orvixcli)
set(ORVIX_INSTALL_DOCDIR share/doc/orvixcli)

set_target_properties(orvixcli PROPERTIES INSTALL_RPATH "$ORIGIN/../${ORVIX_INSTALL_LIBDIR}")
target_compile_definitions(orvixcli PRIVATE
  ORVIX_INSTALLED_PLUGIN_DIR="${CMAKE_INSTALL_PREFIX}/${ORVIX_INSTALL_PLUGINDIR}")
# orvix-hostsim and the libraries link the store, SQLite and the text rules
# statically and need no library of ours.
set_target_properties(orvix-hostsim orvix_framework orvix_hostctl PROPERTIES INSTALL_RPATH "")
set_target_properties(orvix_network_plugin PROPERTIES INSTALL_RPATH "$ORIGIN/..")

install(TARGETS orvixcli orvix-hostsim RUNTIME DESTINATION bin)
install(TARGETS orvix_framework orvix_hostctl LIBRARY DESTINATION ${ORVIX_INSTALL_LIBDIR})
install(TARGETS orvix_network_plugin LIBRARY DESTINATION ${ORVIX_INSTALL_PLUGINDIR})
install(FILES ${PROJECT_SOURCE_DIR}/profiles/default.json DESTINATION ${ORVIX_INSTALL_DATADIR}/profiles)
install(FILES ${PROJECT_SOURCE_DIR}/README.md ${PROJECT_SOURCE_DIR}/packaging/debian/copyright
        DESTINATION ${ORVIX_INSTALL_DOCDIR})
install(DIRECTORY ${PROJECT_SOURCE_DIR}/docs/ DESTINATION ${ORVIX_INSTALL_DOCDIR} FILES_MATCHING PATTERN "*.md")
