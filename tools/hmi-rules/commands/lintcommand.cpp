#include "commands.h"

#include "lint/linter.h"
#include "report/lintreport.h"

#include <algorithm>
#include <memory>

namespace hmirules {

namespace {

/** Checks files together or each by itself, and goes on after one that cannot be used. */
class LintRun
{
public:
    explicit LintRun(const Options &options) : m_options(options) { }

    Outcome run()
    {
        Fault fault;
        if (!readInventory(m_options, &m_inventory, &fault) || !readBase(&fault)) {
            m_report.unusable.push_back(fault);
            return outcome();
        }
        std::vector<RuleFile> readable;
        for (const QByteArray &path : m_options.files) {
            RuleFile file;
            if (!file.read(path, &fault)) {
                m_report.unusable.push_back(fault);
                continue;
            }
            m_report.files.append(file.name());
            if (m_options.each) {
                check({std::move(file)});
            } else {
                readable.push_back(std::move(file));
            }
        }
        check(std::move(readable));
        return outcome();
    }

private:
    bool readBase(Fault *fault)
    {
        for (const QByteArray &path : m_options.base) {
            RuleFile file;
            if (!file.read(path, fault)) {
                return false;
            }
            m_base.push_back(std::move(file));
        }
        return true;
    }

    void check(std::vector<RuleFile> files)
    {
        if (files.empty()) {
            return;
        }
        files.insert(files.begin(), m_base.cbegin(), m_base.cend());
        const RuleBase base(std::move(files));
        m_report.add(base,
                     lint(base, m_inventory, static_cast<int>(m_base.size()), m_options.ignore));
    }

    Outcome outcome() const
    {
        Outcome result;
        // Other formats tell what could not be checked, too.
        result.hasOutput = m_options.format != Format::Text || !m_report.files.isEmpty();
        result.exitCode = exitCode();
        for (const Fault &fault : m_report.unusable) {
            result.errors += toText(fault).toUtf8();
        }
        result.output = formatted().toUtf8();
        return result;
    }

    int exitCode() const
    {
        if (!m_report.unusable.empty()) {
            return exitUnusable;
        }
        const bool fails = std::any_of(m_report.findings.cbegin(), m_report.findings.cend(),
                                       [this](const ReportedFinding &finding) {
                                           return finding.kind->severity >= m_options.failOn;
                                       });
        return fails ? exitFound : exitFine;
    }

    QString formatted() const
    {
        switch (m_options.format) {
        case Format::Json:
            return lintReportAsJson(m_report);
        case Format::Sarif:
            return lintReportAsSarif(m_report);
        default:
            return lintReportAsText(m_report, Paint(isColored(m_options)));
        }
    }

    const Options &m_options;
    Inventory m_inventory;
    std::vector<RuleFile> m_base;
    LintReport m_report;
};

} // namespace

Outcome runLint(const Options &options)
{
    for (const QString &id : options.ignore) {
        if (!findingKind(id)) {
            Fault fault;
            fault.message = "there is no finding \"" + id + "\" to ignore";
            fault.remedy = "\"hmi-rules findings\" lists all.";
            return {exitUnusable, QByteArray(), toText(fault).toUtf8(), false};
        }
    }
    return LintRun(options).run();
}

} // namespace hmirules
