#include "helpcompiler/InternalFiles.h"

#include "helpcompiler/Bytes.h"
#include "helpcompiler/KeywordIndex.h"
#include "helpcompiler/StringTable.h"

#include <cstddef>
#include <utility>

namespace tovimar::helpcompiler {

std::vector<InternalFile> MakeInternalFiles(const HelpDescription& help, const TopicTables& topics,
                                            const SearchIndex& search) {
    StringTable strings;
    KeywordIndex keywords;
    if (help.binaryIndex)
        keywords = KeywordIndex(help, topics);
    const std::string header = IndexHeaderStream(help, topics.Topics().size(), strings);
    auto tables = topics.Write(strings);
    std::string windows = WindowsStream(help.windows, strings);
    std::string contexts = ContextStream(help.contexts, strings);

    std::vector<InternalFile> files;
    const auto add = [&](std::string name, std::string bytes) {
        files.push_back({std::move(name), std::move(bytes)});
    };
    add("/#SYSTEM", SystemStream(help, header, !keywords.IsEmpty()));
    add("/#ITBITS", {});
    files[0].compressed = files[1].compressed = false;
    add("/#IDXHDR", header);
    if (!help.windows.empty())
        add("/#WINDOWS", std::move(windows));
    if (!help.contexts.empty())
        add("/#IVB", std::move(contexts));
    add("/#TOPICS", std::move(tables.topics));
    add("/#URLTBL", std::move(tables.urls));
    add("/#URLSTR", std::move(tables.texts));
    add("/#STRINGS", strings.Bytes());
    for (InternalFile& file : keywords.Files())
        files.push_back(std::move(file));
    add("/$WWAssociativeLinks/Property", std::string(4, '\0'));
    add("/$OBJINST", ObjectStream(help));
    add("/$FIftiMain", help.fullTextSearch ? search.Bytes(help.codePage, help.language) : std::string());
    return files;
}

std::string ContextStream(const std::vector<ContextTarget>& contexts, StringTable& strings) {
    std::string out;
    PutU32(out, static_cast<std::uint32_t>(8 * contexts.size()));
    for (const ContextTarget& context : contexts) {
        PutU32(out, context.id);
        PutU32(out, strings.Add(context.target));
    }
    return out;
}

} // namespace tovimar::helpcompiler
