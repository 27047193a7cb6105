# With HUL_SANITIZE every target is built with AddressSanitizer and
# UndefinedBehaviorSanitizer; the first error halts the program.
if(HUL_SANITIZE)
  add_compile_options(-fsanitize=address,undefined -fno-sanitize-recover=all
                      -fno-omit-frame-pointer)
  add_link_options(-fsanitize=address,undefined -fno-sanitize-recover=all)
endif()
