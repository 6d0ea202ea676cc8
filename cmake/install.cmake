# The programs lie in a folder of their own, with what start-up looks for beside them; the PATH gets links to them.
set(program_folder ${CMAKE_INSTALL_LIBDIR}/kindrel)
set_target_properties(kindrel kindrelctl kindrel-mender PROPERTIES INSTALL_RPATH "")
install(TARGETS kindrel kindrelctl kindrel-mender RUNTIME DESTINATION ${program_folder})
install(DIRECTORY ${CMAKE_RUNTIME_OUTPUT_DIRECTORY}/master ${CMAKE_RUNTIME_OUTPUT_DIRECTORY}/Training
    DESTINATION ${program_folder})
install(FILES packaging/kindrel.desktop packaging/kindrel-mender.desktop DESTINATION ${CMAKE_INSTALL_DATADIR}/applications)
install(FILES packaging/kindrel.svg DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps)
foreach(program kindrel kindrelctl kindrel-mender)
    install(CODE "
        set(bin \"\$ENV{DESTDIR}\${CMAKE_INSTALL_PREFIX}/${CMAKE_INSTALL_BINDIR}\")
        file(MAKE_DIRECTORY \"\${bin}\")
        file(CREATE_LINK ../${program_folder}/${program} \"\${bin}/${program}\" SYMBOLIC)")
endforeach()
