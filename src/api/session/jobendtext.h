#pragma once

#include "api/session/netjob.h"

#include <QString>

/// Why a job has no result, for the user: the part of a sentence that follows "could not be done: ".
QString jobEndText(JobOutcome end);
