// Reads a whole file into memory, for the evaluation programs.
#ifndef TONVEX_TOOLS_MIDIBYTESFILE_H
#define TONVEX_TOOLS_MIDIBYTESFILE_H

#include <fstream>
#include <iterator>
#include <string>
#include <vector>

inline bool ReadBytes(std::string const& path, std::vector<unsigned char>& bytes) {
  std::ifstream in(path, std::ios::binary);
  if (!in) return false;
  bytes.assign(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
  return !in.bad();
}

#endif
