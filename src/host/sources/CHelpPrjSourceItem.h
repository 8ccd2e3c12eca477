#pragma once

#include <cstdint>
#include <string>

namespace tovimar {

class XmlNode;

/// One object of a source project. `ProjectName` is that of the project at the time the item was made.
class CHelpPrjSourceItem {
public:
    /// An element of an XML project: attributes `RelativePath` or `RelPath`, `FileType` or `SubType`,
    /// `BuildAction`, `Link`. The file lies where the link says, else in `vstrProjectFolder`. The name is
    /// that of the file until `Parse`.
    void InitFromElement(const std::string& vstrProjectName, const std::string& vstrProjectFolder,
                         const XmlNode& element);
    /// A file that an XML project names otherwise than by such attributes.
    void InitFromFile(const std::string& vstrProjectName, const std::string& vstrProjectFolder,
                      const std::string& vstrRelativePath, const std::string& vstrSubType);
    /// A form of a text project.
    void InitFromTextProject(const std::string& vstrProjectName, const std::string& vstrFileFullPath,
                             const std::string& vstrFormName, const std::string& vstrFormCaption,
                             const std::string& vstrSubType);
    /// An object of the host: `SubType` is "Form", "Report", "Table", "Query", "Macro", "Worksheet" or
    /// "Chart".
    void InitFromHost(const std::string& vstrProjectName, const std::string& vstrFormName,
                      const std::string& vstrFormCaption, const std::string& vstrSubType);
    void Terminate();

    /// Takes name and caption from a source file of "VB.NET", "C#", "J#", "C++" or "ASP.NET". Without them
    /// there, and with `vfParseDesignerFile`, from its twin: that of "Form1.cs" is "Form1.Designer.cs", and
    /// the other way round. What neither file tells is the file's name without "Designer" and extension.
    /// Raises what reading a file raises; a missing file tells nothing.
    void Parse(const std::string& vstrFileFullPath, const std::string& vstrProgrammingLanguage,
               bool vfParseDesignerFile = true);

    /// Code of `SubType`, 0 for an unknown one.
    std::int32_t ObjType() const;
    /// The name as file names use it.
    std::string FormNameNormalized() const;

    std::string ProjectName;
    /// An item of an XML project file.
    bool IsVSProjectItem = false;
    /// Beside those of the host "UserControl" and "UserDocument".
    std::string SubType;
    std::string FormName;
    /// May be empty.
    std::string FormCaption;
    /// Used inside another object, so it gets no topic of its own.
    bool Skipped = false;

    /// Of an item of a project file: full path, path in the project, what the build does with it, and the
    /// path of a file that the project only links to.
    std::string FileName;
    std::string RelativePath;
    std::string BuildAction;
    std::string Link;
};

/// The other of the two files of a form: "C:\P\Form1.Designer.cs" of "C:\P\Form1.cs" and back.
std::string DesignerTwinOf(const std::string& path);

} // namespace tovimar
