#pragma once

#include "matrix.h"
#include "report/paint.h"

namespace hmirules {

/** A grid of letters with the lines that decided, and where popups are blocked. */
QString matrixAsText(const RuleBase &base, const Matrix &matrix, const Paint &paint);

/** One line for each pair, with a heading. */
QString matrixAsCsv(const RuleBase &base, const Matrix &matrix);

/** One line for each popup and each domain or view in which it is blocked, with a heading. */
QString blockingAsCsv(const RuleBase &base, const Matrix &matrix);

/** A page that needs nothing else. */
QString matrixAsHtml(const RuleBase &base, const Matrix &matrix);

} // namespace hmirules
