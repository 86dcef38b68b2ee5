# The Debian package: cpack -G DEB, in the build folder, makes orvex_VERSION_ARCHITECTURE.deb.

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME orvex)
set(CPACK_PACKAGE_VENDOR "The Orvex authors")
set(CPACK_PACKAGE_CONTACT "The Orvex authors <maintainers@orvex.example>")
set(CPACK_STRIP_FILES ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
    OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION net)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON) # the libraries of the programs
set(CPACK_DEBIAN_PACKAGE_RECOMMENDS "fonts-dejavu-core, shared-mime-info")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "radio diagnostics monitor for a handset")
set(CPACK_PACKAGE_DESCRIPTION "Orvex subscribes to the diagnostic log of a handset's baseband, decodes every
message and shows what the modem knows as lists that change while you watch:
serving cell, neighbors, measurements, packet data contexts, SIM files.
.
It comes with koratd, which plays captures in place of a handset, and with
orvex-decode, which decodes captures offline.")
include(CPack)
