#pragma once

#include "taskfamily.h"

#include <span>

/// The types of records that send files or certificates.
namespace UploadFamilies {

std::span<const TaskFamily> all();

} // namespace UploadFamilies
