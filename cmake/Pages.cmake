# Man pages and completions of shells, which the program makes from its declared commands. They lie
# in share/ of the build folder as after the installation.
set(pages_folder ${PROJECT_BINARY_DIR}/share)
set(man_folder ${pages_folder}/man/man1)
set(bash_folder ${pages_folder}/bash-completion/completions)
set(zsh_folder ${pages_folder}/zsh/vendor-completions)
set(fish_folder ${pages_folder}/fish/vendor_completions.d)

set(page_commands
    COMMAND $<TARGET_FILE:brindle_cli> manual --folder ${man_folder}
    COMMAND $<TARGET_FILE:brindle_cli> completion bash >${bash_folder}/brindle
    COMMAND $<TARGET_FILE:brindle_cli> completion zsh >${zsh_folder}/_brindle
    COMMAND $<TARGET_FILE:brindle_cli> completion fish >${fish_folder}/brindle.fish)
add_custom_command(OUTPUT ${pages_folder}/pages.stamp
    COMMAND ${CMAKE_COMMAND} -E rm -rf ${man_folder}
    COMMAND ${CMAKE_COMMAND} -E make_directory
            ${man_folder} ${bash_folder} ${zsh_folder} ${fish_folder}
    ${page_commands}
    COMMAND ${CMAKE_COMMAND} -E touch ${pages_folder}/pages.stamp
    DEPENDS brindle_cli COMMENT "Making man pages and completions")
add_custom_target(brindle_pages ALL DEPENDS ${pages_folder}/pages.stamp)

if(BRINDLE_INSTALL)
    # A build of single targets may have none.
    install(DIRECTORY ${man_folder} DESTINATION ${CMAKE_INSTALL_MANDIR} COMPONENT program OPTIONAL)
    foreach(folder bash-completion zsh fish)
        install(DIRECTORY ${pages_folder}/${folder} DESTINATION ${CMAKE_INSTALL_DATADIR}
                COMPONENT program OPTIONAL)
    endforeach()
endif()
