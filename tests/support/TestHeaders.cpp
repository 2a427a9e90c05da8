// The source that the precompiled headers of the tests are compiled with. It holds nothing of its own.
