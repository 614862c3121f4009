// The shared library's own translation unit; the entry points live in the components.
