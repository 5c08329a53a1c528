/**
 * @file
 * @brief Reading the source tree.
 */
#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

/** The files of a source tree, without what is built or kept by tools; relative paths, sorted. */
std::vector<std::string> filesOf(const std::filesystem::path& root);

/** The contents of a file, empty when it cannot be read. */
std::string contentsOf(const std::filesystem::path& file);

/** True for C++ and C sources and headers. */
bool isSource(std::string_view path);

/** True for files that people read as text. */
bool isText(std::string_view contents);

/** A small source tree for testing the checks themselves. */
class PlantedTree {
public:
    PlantedTree();
    ~PlantedTree();
    PlantedTree(const PlantedTree&) = delete;
    PlantedTree& operator=(const PlantedTree&) = delete;

    const std::filesystem::path& root() const { return _root; }
    void plant(const std::string& path, const std::string& contents) const;

private:
    std::filesystem::path _root;
};
