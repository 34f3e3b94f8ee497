"""The binding generator: host headers -> model -> C++ and Python sources."""
