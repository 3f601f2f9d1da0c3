// Nothing but a source to build the precompiled header with.
