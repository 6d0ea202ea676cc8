# Every compiler flag of the house, in one place.
add_library(kindrel_flags INTERFACE)
target_compile_options(kindrel_flags INTERFACE
    -Wall -Wextra -Wpedantic -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual -Wimplicit-fallthrough -Werror)
target_compile_definitions(kindrel_flags INTERFACE
    QT_NO_CAST_FROM_ASCII QT_NO_CAST_TO_ASCII QT_NO_URL_CAST_FROM_STRING QT_NO_FOREACH QT_NO_KEYWORDS
    QT_DISABLE_DEPRECATED_BEFORE=0x060400)

if(KINDREL_SANITIZE)
    target_compile_options(kindrel_flags INTERFACE
        -fsanitize=address,undefined -fno-sanitize-recover=undefined -fno-omit-frame-pointer)
    target_link_options(kindrel_flags INTERFACE -fsanitize=address,undefined)
endif()
