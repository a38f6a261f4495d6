#pragma once

// What the system says about a failure, in the language of the session. Its own words are English,
// since no process of ours takes the language of its C library.

#include <exception>
#include <string>

namespace tzhost {

// Of a number of errno. In another language a failure without words there is told by its number.
[[nodiscard]] std::string systemWords(int problem);

// Of what was thrown: all that memory is too short for is said alike, whatever the library calls
// it.
[[nodiscard]] std::string systemWords(std::exception const& thrown);

}  // namespace tzhost
