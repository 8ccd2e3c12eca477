#pragma once

#include <string>
#include <vector>

/// Files of the web help and the script by which a topic finds its frame page.
namespace tovimar {

/// Fills a template: project tags, then the tags of the list ("tag|value", cut at the first "|", without
/// regard to case), then the message parameters. Written to `target` unless that is empty: UTF-8 where the
/// text says so, else the ANSI code page. The text is also the result, empty for a missing template.
/// A failure of the writer is raised.
std::string FillFileFromTemplate(const std::string& templatePath, const std::string& target,
                                 const std::vector<std::string>& tags);

/// Puts the script behind the page; a page that holds "wbh" anywhere stays. The script makes a topic that
/// is opened by itself load main.htm, with the topic's address behind the question mark.
void AddWebHelpScript(std::string& text);
void AddWebHelpScriptToFile(const std::string& path);
/// True when a script stood behind the page and was taken out.
bool RemoveWBHScript(const std::string& path);

} // namespace tovimar
