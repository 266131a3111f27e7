#include "screens/SupportPages.h"

#include <fstream>

#include "runtime/HostPath.h"

namespace Tulk {

std::vector<std::string> ParseSupportPages(std::istream& input) {
  std::vector<std::string> pages;
  std::string page;
  std::string line;
  while (std::getline(input, line)) {
    if (!line.empty() && line.front() == '#') {
      continue;
    }
    if (!line.empty() && line.front() == '$') {
      pages.push_back(std::move(page));
      page.clear();
      continue;
    }
    page += line;
    page += '\n';
  }
  pages.push_back(std::move(page));
  return pages;
}

std::vector<std::string> ReadSupportPages() {
  std::ifstream file(HostPath(kSupportFilePath));
  if (!file) {
    return {};
  }
  return ParseSupportPages(file);
}

}  // namespace Tulk
