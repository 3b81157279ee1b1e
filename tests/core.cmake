# zebcore tests.
