// The shared library is made of the floors' archives; this file gives the target a language.
