// Nothing of its own: the target is there for the precompiled header that all test programs use.
