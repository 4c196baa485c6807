# korcontrols_warnings: the options that all of the project's targets compile with. Warnings are errors.
add_library(korcontrols_warnings INTERFACE)
target_compile_options(korcontrols_warnings INTERFACE
  -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Werror
  # Casts between procedure types are the platform's way (GetProcAddress, window procedures).
  -Wno-cast-function-type)
target_compile_definitions(korcontrols_warnings INTERFACE UNICODE _UNICODE)
