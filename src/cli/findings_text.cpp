#include "cli/findings_text.h"

#include "cli/terminal.h"

#include <algorithm>

void PrintFindings(std::ostream& stream, const std::string& path, const FileCheck& check)
{
    const std::string file = Printable(path);
    std::vector<const FileFinding*> last(check.counts.size());
    for (const FileFinding& finding : check.findings) {
        const Rule& rule = RuleOf(finding.rule);
        stream << file << ':' << finding.line << ':' << finding.column << ": " << SeverityName(rule.severity) << ' '
               << rule.code << ": " << Printable(finding.text) << '\n';
        last[std::size_t(finding.rule)] = &finding;
    }
    for (const Rule& rule : HDRules()) {
        const std::size_t number = std::size_t(rule.id), most = CProblems::MostOfARule;
        if (check.counts[number] > most)
            stream << file << ": " << check.counts[number] - most << " more like the one in line " << last[number]->line
                   << ", column " << last[number]->column << " (" << rule.code << ")\n";
    }
}
