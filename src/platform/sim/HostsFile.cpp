#include "platform/api/HostsFile.h"

#include <cerrno>
#include <cstring>
#include <fstream>
#include <sstream>

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace HykCtl::Network {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::HostsFile::") + method;
}

std::vector<std::string> ReadLines(const std::string& path) {
  std::ifstream in(path);
  if (!in) {
    Sim::Fail("Cannot read " + path + ": " + std::strerror(errno));
  }
  std::vector<std::string> lines;
  for (std::string line; std::getline(in, line);) {
    lines.push_back(line);
  }
  return lines;
}

void WriteLines(const std::string& path, const std::vector<std::string>& lines) {
  std::string text;
  for (const std::string& line : lines) {
    text += line;
    text += '\n';
  }
  try {
    Sim::WriteFileAtomically(path, text);
  } catch (const Sim::StateError&) {
    Sim::Fail("Cannot write " + path + ": " + std::strerror(errno));
  }
}

// The address and names of one line; false for blank and comment lines.
bool ParseLine(const std::string& line, HostsFile::Entry& entry) {
  std::istringstream words(line.substr(0, line.find('#')));
  if (!(words >> entry.address)) {
    return false;
  }
  entry.names.clear();
  for (std::string name; words >> name;) {
    entry.names.push_back(name);
  }
  return !entry.names.empty();
}

std::string Lower(std::string text) {
  for (char& c : text) {
    if (c >= 'A' && c <= 'Z') {
      c = static_cast<char>(c - 'A' + 'a');
    }
  }
  return text;
}

bool SameHost(const std::string& a, const std::string& b) {
  const std::string x = Lower(a);
  const std::string y = Lower(b);
  if (x == y) {
    return true;
  }
  const std::string xFirst = x.substr(0, x.find('.'));
  const std::string yFirst = y.substr(0, y.find('.'));
  const bool xBare = xFirst.size() == x.size();
  const bool yBare = yFirst.size() == y.size();
  return (xBare && x == yFirst) || (yBare && y == xFirst);
}

}  // namespace

HostsFile::HostsFile() : path_(Sim::RootPath("/etc/hosts")) {
}

HostsFile::HostsFile(std::string path) : path_(std::move(path)) {
}

std::vector<HostsFile::Entry> HostsFile::GetEntries() const {
  Sim::Query(Op("GetEntries"));
  std::vector<Entry> entries;
  Entry entry;
  for (const std::string& line : ReadLines(path_)) {
    if (ParseLine(line, entry)) {
      entries.push_back(entry);
    }
  }
  return entries;
}

int HostsFile::RemoveEntryByHostName(const std::string& hostName) {
  Sim::Query(Op("RemoveEntryByHostName"));
  std::vector<std::string> kept;
  int removed = 0;
  Entry entry;
  for (const std::string& line : ReadLines(path_)) {
    bool names = false;
    if (ParseLine(line, entry)) {
      for (const std::string& name : entry.names) {
        names = names || SameHost(name, hostName);
      }
    }
    if (names) {
      ++removed;
    } else {
      kept.push_back(line);
    }
  }
  if (removed > 0) {
    WriteLines(path_, kept);
  }
  return removed;
}

void HostsFile::AddEntry(const Entry& entry) {
  Sim::Query(Op("AddEntry"));
  if (entry.address.empty() || entry.names.empty()) {
    Sim::Fail("A hosts entry needs an address and a name");
  }
  std::vector<std::string> lines;
  std::ifstream probe(path_);
  if (probe) {
    lines = ReadLines(path_);
  }
  std::string line = entry.address;
  for (const std::string& name : entry.names) {
    line += (line == entry.address ? '\t' : ' ');
    line += name;
  }
  lines.push_back(line);
  WriteLines(path_, lines);
}

}  // namespace HykCtl::Network
