#pragma once

#include <filesystem>

#include <QString>

namespace penmoor {

// Paths between Qt and the standard library without losing letters on any platform.
std::filesystem::path toPath(const QString& text);
QString toQString(const std::filesystem::path& path);

// The folder of the running executable, where the optional program files live.
std::filesystem::path programFolder();

} // namespace penmoor
