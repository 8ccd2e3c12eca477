#include "platform/Error.h"
#include "platform/Interrupt.h"
#include "platform/access/AccessApplication.h"
#include "platform/access/ApplicationModel.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

namespace tovimar::platform::access {

namespace {

bool HasDesign(ObjectKind kind) {
    return kind == ObjectKind::Form || kind == ObjectKind::Report || kind == ObjectKind::Macro;
}

std::string DefinitionError(ApplicationModel& model, ObjectKind kind, const std::string& name) {
    try {
        if (kind == ObjectKind::Table)
            model.FindTable(name);
        else if (kind == ObjectKind::Query)
            model.FindQuery(name);
        return {};
    } catch (const RaisedError& failure) {
        return failure.what();
    }
}

ObjectSummary Summarize(ApplicationModel& model, ObjectKind kind, const std::string& name) {
    ObjectSummary summary{kind, name, {}, true, {}};
    if (!HasDesign(kind)) {
        summary.error = DefinitionError(model, kind, name);
        return summary;
    }
    summary.designKnown = model.DesignKnown(kind, name);
    const auto* design = model.FindDesign(kind, name);
    if (design && kind != ObjectKind::Macro)
        summary.caption = text::Trim(design->root->Text("Caption"));
    if (summary.designKnown)
        summary.error = model.DesignError(kind, name);
    model.TrimDesigns();
    return summary;
}

void AddNote(const std::vector<ObjectSummary>& objects, ObjectKind kind, const char* word,
             std::vector<std::string>& notes) {
    std::size_t unknown = 0;
    std::size_t damaged = 0;
    for (const auto& object : objects) {
        unknown += object.kind == kind && !object.designKnown ? 1 : 0;
        damaged += object.kind == kind && !object.error.empty() ? 1 : 0;
    }
    const auto noun = [&](std::size_t count) {
        const std::string singular = word;
        const auto plural = singular == "query" ? std::string("queries") : singular + "s";
        return std::to_string(count) + " " + (count == 1 ? singular : plural);
    };
    if (unknown > 0)
        notes.push_back(noun(unknown) +
                        (unknown == 1
                             ? " is known by name only, because the database file doesn't give its "
                               "design (those of 1997 can't be read); it gets no topic. Export it as "
                               "text to document it."
                             : " are known by name only, because the database file doesn't give "
                               "their designs (those of 1997 can't be read); they get no topics. Export "
                               "them as text to document them."));
    if (damaged > 0)
        notes.push_back(noun(damaged) + " can't be read.");
}

bool IsSystemTable(ObjectKind kind, const std::string& name) {
    return kind == ObjectKind::Table && text::StartsWithIgnoringCase(name, "MSys");
}

} // namespace

ApplicationSummary SummarizeApplication(const std::string& nativePath) {
    ApplicationModel model(nativePath);
    return SummarizeModel(model);
}

ApplicationSummary SummarizeModel(ApplicationModel& model) {
    ApplicationSummary summary;
    summary.fullName = model.FullName();
    summary.name = BaseNameOf(model.FullName());
    for (const auto kind : {ObjectKind::Table, ObjectKind::Query, ObjectKind::Form, ObjectKind::Report,
                            ObjectKind::Macro, ObjectKind::Module})
        for (const auto& name : model.Names(kind)) {
            if (InterruptRequested())
                return summary;
            if (!IsSystemTable(kind, name))
                summary.objects.push_back(Summarize(model, kind, name));
        }
    summary.notes = model.Notes();
    AddNote(summary.objects, ObjectKind::Table, "table", summary.notes);
    AddNote(summary.objects, ObjectKind::Query, "query", summary.notes);
    AddNote(summary.objects, ObjectKind::Form, "form", summary.notes);
    AddNote(summary.objects, ObjectKind::Report, "report", summary.notes);
    AddNote(summary.objects, ObjectKind::Macro, "macro", summary.notes);
    return summary;
}

} // namespace tovimar::platform::access
