#pragma once

#include "results.h"

/** The tables of a run for a terminal; the figures of @p before, if any, stand beside those of @p
 * now. */
QString asText(const Results &now, const Results &before);

/** The same as a document that tells how it came about. */
QString asMarkdown(const Results &now, const Results &before);
