# The Debian package: `./dev package` (or `cpack -G DEB` in a build
# configured with the package preset) makes orvixcli_<version>_amd64.deb from
# the install rules of every part of the project, components or not.
#
# ORVIX_SYSTEM_HOST_DB: when set, programs of this build use that store
# unless $ORVIX_HOST_DB names another, instead of the per-user store under
# $XDG_STATE_HOME or $HOME. The package sets it, so that an installed
# orvixcli works for every user and with no environment at all; the
# package's postinst creates the store, and purging the package removes it.
set(ORVIX_SYSTEM_HOST_DB "" CACHE STRING "the host store of an installed system (empty: per-user store)")
if(ORVIX_SYSTEM_HOST_DB)
  if(NOT IS_ABSOLUTE "${ORVIX_SYSTEM_HOST_DB}")
    message(FATAL_ERROR "ORVIX_SYSTEM_HOST_DB must be an absolute path, not '${ORVIX_SYSTEM_HOST_DB}'")
  endif()
  target_compile_definitions(orvix_hoststore PUBLIC ORVIX_SYSTEM_HOST_DB="${ORVIX_SYSTEM_HOST_DB}")
endif()

set(ORVIX_DEB_RELEASE 1)
set(ORVIX_DEB_VERSION ${PROJECT_VERSION}-${ORVIX_DEB_RELEASE})
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(ORVIX_DEB_DIR ${CMAKE_BINARY_DIR}/debian)

# The Debian changelog, compressed as Debian wants it: gzip -9, without the
# file's name and time, so the same sources give the same package.
configure_file(${PROJECT_SOURCE_DIR}/packaging/debian/changelog.in ${ORVIX_DEB_DIR}/changelog @ONLY)
add_custom_command(
  OUTPUT ${ORVIX_DEB_DIR}/changelog.Debian.gz
  COMMAND gzip -9 -n -c ${ORVIX_DEB_DIR}/changelog > ${ORVIX_DEB_DIR}/changelog.Debian.gz
  DEPENDS ${ORVIX_DEB_DIR}/changelog
  COMMENT "Compressing the Debian changelog")
add_custom_target(orvix_deb_changelog ALL DEPENDS ${ORVIX_DEB_DIR}/changelog.Debian.gz)
install(FILES ${ORVIX_DEB_DIR}/changelog.Debian.gz DESTINATION ${ORVIX_INSTALL_DOCDIR})

# Maintainer scripts exist only for a build with a system store to make.
set(ORVIX_DEB_SCRIPTS)
if(ORVIX_SYSTEM_HOST_DB)
  foreach(script postinst postrm)
    configure_file(${PROJECT_SOURCE_DIR}/packaging/debian/${script}.in ${ORVIX_DEB_DIR}/${script} @ONLY
                   FILE_PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ
                                    WORLD_EXECUTE)
    list(APPEND ORVIX_DEB_SCRIPTS ${ORVIX_DEB_DIR}/${script})
  endforeach()
endif()

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME orvixcli)
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGE_CONTACT "Orvix CLI developers <orvixcli@example.com>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "management tool of a simulated hypervisor host")
# CPack puts the summary above the description as its synopsis line.
set(CPACK_DEBIAN_PACKAGE_DESCRIPTION
    "orvixcli lists and changes the networking of a hypervisor host: standard and
distributed virtual switches, port groups and their policies, physical NICs,
kernel IP interfaces, routes, DNS, netstacks, IPsec, the firewall, LACP and
the networking of virtual machines. Its output is readable by people and by
scripts (JSON, XML, CSV, key-value).
.
The host is simulated: its whole state lives in one SQLite file, made when
the package is installed. orvix-hostsim creates hosts from profiles, dumps
them, arms faults and draws the host's topology as a Graphviz graph.")
set(CPACK_DEBIAN_PACKAGE_MAINTAINER "${CPACK_PACKAGE_CONTACT}")
set(CPACK_DEBIAN_PACKAGE_SECTION admin)
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)
set(CPACK_DEBIAN_PACKAGE_RELEASE ${ORVIX_DEB_RELEASE})
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
# `orvix-hostsim graph` writes what dot draws.
set(CPACK_DEBIAN_PACKAGE_SUGGESTS graphviz)
# dpkg-shlibdeps must find our own libraries, which are in no public folder.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${ORVIX_INSTALL_LIBDIR})
set(CPACK_DEBIAN_PACKAGE_CONTROL_EXTRA ${ORVIX_DEB_SCRIPTS})
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_STRIP_FILES ON)
# One package with everything any install() rule names, whatever component
# it belongs to.
set(CPACK_DEB_COMPONENT_INSTALL OFF)
set(CPACK_MONOLITHIC_INSTALL ON)
include(CPack)
