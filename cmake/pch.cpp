// Nothing: what is compiled with this file is the precompiled header.
