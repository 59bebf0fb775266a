#ifndef QRX_OIF_OUTPUT_H
#define QRX_OIF_OUTPUT_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/output/korC_OdbRequestTable.h"

class oif_KeywordLine;

/// Opens a group of output requests that are equally frequent:
///     *Output, field|history[, variable=PRESELECT|ALL][, filter=FILTER]FREQUENCY[, time marks=YES|NO]
/// FREQUENCY is ", frequency=N", ", number interval=N", ", time interval=T", ", mode list" (the modes follow
/// in data lines) or ", time points=NAME". One that the procedure has anyway isn't written. A frequency of 0
/// says that there is no output.
class oif_Output final : public qkw_KeywordOf<oif_Output> {
public:
    using TypeEnm = korC_OdbRequest::TypeEnm;

    /// Every so many increments.
    oif_Output(const korC_OdbChannel& channel, TypeEnm type, int frequency, bool pre, bool all,
               unsigned stepType, const cow_String& filter);
    /// In so many intervals. `stepTime` is the period of an explicit step.
    oif_Output(const korC_OdbChannel& channel, TypeEnm type, int numberInterval, bool timeMarks, bool pre,
               bool all, double stepTime, unsigned stepType, const cow_String& filter);
    /// In intervals of a time.
    oif_Output(const korC_OdbChannel& channel, TypeEnm type, double timeInterval, bool timeMarks, bool pre,
               bool all, unsigned stepType, const cow_String& filter);
    /// For modes by their numbers; for all if there are none.
    oif_Output(const korC_OdbChannel& channel, TypeEnm type, const cls_xpListInt& modeList, bool pre,
               bool all, unsigned stepType, const cow_String& filter);
    /// At the points of a list in the model.
    oif_Output(const korC_OdbChannel& channel, TypeEnm type, const cow_String& timePoints, bool timeMarks,
               bool pre, bool all, unsigned stepType, const cow_String& filter);

    bool Active() const { return true; }
    void Write(utl_Stream& stream) const override;

private:
    oif_Output(const korC_OdbChannel& channel, TypeEnm type, bool timeMarks, bool pre, bool all,
               unsigned stepType, const cow_String& filter);
    void AddNumberInterval(oif_KeywordLine& line) const;
    void WriteModes(utl_Stream& stream) const;

    int frequency_ = 0;
    int numberInterval_ = 0;
    bool timeMarks_;
    cow_String filter_;
    cow_String timePoints_;
    double timeInterval_ = 0.0;
    cls_xpListInt modeList_;
    TypeEnm type_;
    bool pre_;
    bool all_;
    double stepTime_ = 0.0;
    unsigned stepType_;
    korC_OdbChannel channel_;
};

/// Variables of one kind that a request asks for, of those that the procedure knows. All of these keywords
/// end alike:
///     KEYWORD[, PARAMETERS][, variable=PRESELECT|ALL]
///     NAME, NAME, ...
/// Names are listed only without a variable parameter. A keyword that has neither writes nothing.
class oif_OutputVariables : public qkw_Keyword {
protected:
    using PrintEnm = korC_OdbRequestSpec::PrintEnm;

    oif_OutputVariables(const korC_OdbRequest& request, unsigned stepType, bool pre, bool all)
        : request_(request), stepType_(stepType), pre_(pre), all_(all) {}

    /// What decks call those of the request's variables that `accepts(spec, isComponent)` takes.
    /// `byVariable`: a component goes by the name of its variable.
    template <class Accepts>
    cls_xpListString Identifiers(const Accepts& accepts, bool byVariable = false) const {
        cls_xpListString identifiers;
        for (int i = 0; i < request_.variables.Length(); ++i) {
            const cow_String& name = request_.variables[i];
            const korC_OdbRequestTable& table = korC_OdbRequestTable::Instance();
            const bool isComponent = !table.IsParentRequest(name, stepType_);
            const cow_String variable = isComponent ? table.RequestFromComponent(name, stepType_) : name;
            const korC_OdbRequestSpec& spec = table.Request(variable, stepType_);
            if (!accepts(spec, isComponent)) continue;
            AppendNew(identifiers, IdentifierOf(spec, byVariable ? variable : name));
        }
        return identifiers;
    }
    cls_xpListString IdentifiersOf(PrintEnm print) const {
        return Identifiers([print](const korC_OdbRequestSpec& spec, bool) { return spec.Print() == print; });
    }
    bool HasNothing(const cls_xpListString& identifiers) const {
        return identifiers.IsEmpty() && !pre_ && !all_;
    }
    /// Ends the keyword line, with the variable parameter if there is one.
    void EndLine(utl_Stream& stream) const;
    /// The names in lines; none where a variable parameter says it.
    void WriteNames(utl_Stream& stream, const cls_xpListString& identifiers, int perLine = 16) const;
    /// The whole keyword; nothing if there is nothing to ask for. Without a set, no parameter.
    void WriteKeyword(utl_Stream& stream, const char* keyword, const char* parameter,
                      const cow_String& setName, const cls_xpListString& identifiers, int perLine = 16) const;

    korC_OdbRequest request_;
    unsigned stepType_;
    bool pre_;
    bool all_;

private:
    static void AppendNew(cls_xpListString& identifiers, const cow_String& identifier);
    static cow_String IdentifierOf(const korC_OdbRequestSpec& spec, const cow_String& name) {
        return spec.HasIdentifiers() ? spec.InputFileIdentifier(name) : name;
    }
};

/// "*Node Output, nset=SET", eight names a line.
class oif_NodeOutput final : public qkw_KeywordOf<oif_NodeOutput, oif_OutputVariables> {
public:
    /// Without `requireVariables` the keyword stands bare when it has nothing to ask for.
    oif_NodeOutput(const korC_OdbRequest& request, unsigned stepType, const cow_String& setName, bool pre,
                   bool all, bool requireVariables)
        : qkw_KeywordOf(request, stepType, pre, all), setName_(setName), requireVariables_(requireVariables) {
    }
    void Write(utl_Stream& stream) const override;

private:
    cow_String setName_;
    bool requireVariables_;
};

/// "*Element Output, elset=SET, rebar, directions=YES|NO" with a line of section points ahead of the names;
/// once more for every further sixteen points.
class oif_ElementOutput final : public qkw_KeywordOf<oif_ElementOutput, oif_OutputVariables> {
public:
    oif_ElementOutput(const korC_OdbChannel& channel, const korC_OdbRequest& request, unsigned stepType,
                      const cow_String& setName, bool pre, bool all, bool rebar)
        : qkw_KeywordOf(request, stepType, pre, all), isField_(channel.IsField()), setName_(setName),
          rebar_(rebar) {}
    void Write(utl_Stream& stream) const override;

private:
    bool isField_;
    cow_String setName_;
    bool rebar_;
};

/// "*Contact Output, nset=SET, master=M, slave=S, cpset=C, surface=SURFACE".
class oif_ContactOutput final : public qkw_KeywordOf<oif_ContactOutput, oif_OutputVariables> {
public:
    oif_ContactOutput(const korC_OdbRequest& request, unsigned stepType, bool pre, bool all,
                      const cow_String& master, const cow_String& slave, const cow_String& cpset,
                      const cow_String& setName, bool isHistory)
        : qkw_KeywordOf(request, stepType, pre, all), master_(master), slave_(slave), cpset_(cpset),
          setName_(setName), isHistory_(isHistory) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String master_;
    cow_String slave_;
    cow_String cpset_;
    cow_String setName_;
    bool isHistory_;
};

/// "*Energy Output, elset=SET".
class oif_EnergyOutput final : public qkw_KeywordOf<oif_EnergyOutput, oif_OutputVariables> {
public:
    oif_EnergyOutput(const korC_OdbRequest& request, unsigned stepType, const cow_String& setName, bool pre,
                     bool all)
        : qkw_KeywordOf(request, stepType, pre, all), setName_(setName) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String setName_;
};

/// "*Incrementation Output".
class oif_IncrementationOutput final : public qkw_KeywordOf<oif_IncrementationOutput, oif_OutputVariables> {
public:
    oif_IncrementationOutput(const korC_OdbRequest& request, unsigned stepType, bool pre, bool all)
        : qkw_KeywordOf(request, stepType, pre, all) {}
    void Write(utl_Stream& stream) const override;
};

/// "*Integrated Output, section=SECTION".
class oif_IntegratedOutput final : public qkw_KeywordOf<oif_IntegratedOutput, oif_OutputVariables> {
public:
    oif_IntegratedOutput(const korC_OdbRequest& request, unsigned stepType, bool pre, bool all)
        : qkw_KeywordOf(request, stepType, pre, all) {}
    void Write(utl_Stream& stream) const override;
};

/// "*Modal Output". It knows no preselection.
class oif_ModalOutput final : public qkw_KeywordOf<oif_ModalOutput, oif_OutputVariables> {
public:
    oif_ModalOutput(const korC_OdbRequest& request, unsigned stepType, bool all)
        : qkw_KeywordOf(request, stepType, false, all) {}
    void Write(utl_Stream& stream) const override;
};

/// "*Radiation Output, elset=SET". It knows no preselection.
class oif_RadiationOutput final : public qkw_KeywordOf<oif_RadiationOutput, oif_OutputVariables> {
public:
    oif_RadiationOutput(const korC_OdbRequest& request, unsigned stepType, const cow_String& setName,
                        bool all)
        : qkw_KeywordOf(request, stepType, false, all), setName_(setName) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String setName_;
};

#endif
