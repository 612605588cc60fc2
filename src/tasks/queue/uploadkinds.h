#pragma once

#include "tasks/queue/taskkind.h"

#include <span>

/// The types of records that send files or certificates.
namespace UploadFamilies {

std::span<const TaskKind> all();

} // namespace UploadFamilies
