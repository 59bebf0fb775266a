# CPack lets the scripts of a Debian package with a shared library call ldconfig, which the package's trigger does.
foreach(package ${CPACK_PACKAGE_FILES})
    if(package MATCHES "/libqrxptinputfilewriter-dev_[^/]*\\.deb$")
        set(folder ${CPACK_TEMPORARY_DIRECTORY}/development-again)
        file(REMOVE_RECURSE ${folder})
        execute_process(COMMAND dpkg-deb --raw-extract ${package} ${folder} COMMAND_ERROR_IS_FATAL ANY)
        file(REMOVE ${folder}/DEBIAN/postinst ${folder}/DEBIAN/postrm)
        execute_process(COMMAND dpkg-deb --root-owner-group -Zxz --build ${folder} ${package}
            OUTPUT_QUIET COMMAND_ERROR_IS_FATAL ANY)
        file(REMOVE_RECURSE ${folder})
    endif()
endforeach()
