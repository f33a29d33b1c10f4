// The plan drawing of a project: sites with their outlines, height points labelled with their
// heights, placed objects, and the last overlay snapshot, fitted into an 800 x 800 SVG picture.
#pragma once

#include <string>

#include "host/Project.h"

std::string DrawPlan(const CProject& project);
