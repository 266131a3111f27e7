#include "include/ProcessFlags.h"

namespace Tulk {

bool localConsole = false;
bool monochrome = false;
bool loggedIn = false;
bool exitPending = false;
RuntimeFrame* currentWindow = nullptr;
std::string currentUser;
std::string smartCardUser;
bool passwordWasEmpty = false;

}  // namespace Tulk
