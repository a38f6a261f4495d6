// A library made of whole archives still needs one source of its own.
