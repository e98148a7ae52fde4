/// @file
/// Every exported function of the library, in a form in which a program can call them all.
#pragma once

#include "tests/catalogue/Sink.h"
#include "tests/catalogue/Source.h"
#include "tests/catalogue/TypeNames.h"

#include <memory>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace ZarnMath::Catalogue {

/// Where the bits of a result come from.
enum class NumberClass
{
    Arithmetic, ///< exact and correctly rounded operations alone: the same everywhere
    Platform    ///< the mathematical functions of the machine's C library too
};

/// A call that draws its arguments and puts its results. A class of ours in place of `std::function`, which takes twice as
/// long to compile, and there are some 250 of them.
class Call
{
public:
    Call() = default;
    Call(const Call&) = delete;
    Call& operator=(const Call&) = delete;
    virtual ~Call() = default;

    virtual void operator()(Source& in, Sink& out) const = 0;
};

struct Function
{
    std::string name;   ///< qualified, with the types of its parameters; `ZarnMath::` and `std::` are left out
    std::string family; ///< the header that declares it, without directory and extension
    NumberClass numberClass;
    std::unique_ptr<const Call> call;
};

/// All of them, in the order of the headers.
[[nodiscard]] std::vector<Function> ListFunctions();

/// What the draws of one call share: a coefficient needs its curve, a count its array.
struct Draft
{
    Source& in;
    Coefficients cubic{};
    int count = 0;
};

/// Adds the functions of one header.
///
/// A function is added by its type, which tells overloads apart and gives the name its parameters, and by one *draw* for
/// each argument (Draws.h): a callable that takes the draft and gives a holder. A holder has `Argument()`, and
/// `Report(Sink&)`, which puts what the call may have changed.
class Family
{
public:
    Family(std::vector<Function>& functions, const char* name) : list(functions), family(name) {}

    /// A free function or a static member.
    template <typename Signature, typename... Draws>
    void Add(const char* name, std::type_identity_t<Signature>* function, Draws... draws)
    {
        AddDrawn<Signature>(name, function, draws...);
    }

    /// A member, after the draw of its object.
    template <typename Object, typename Signature, typename... Draws>
    void AddMember(const char* name, std::type_identity_t<Signature> Object::*member, Draws... draws)
    {
        AddDrawn<Signature>(name, member, draws...);
    }

    /// A function whose arguments depend on each other: `body(call, in, out)` calls what it is given.
    template <typename Signature, typename Body>
    void AddWith(const char* name, std::type_identity_t<Signature>* function, Body body)
    {
        AddBody(NameOf<Signature>(name), [function, body](Source& in, Sink& out) { body(function, in, out); });
    }

    /// What has no address, or calls several functions.
    template <typename Body>
    void AddBody(std::string name, Body body)
    {
        Append(std::move(name), std::make_unique<CallOf<Body>>(body));
    }

    /// The class of what is added from here on.
    void Set(NumberClass value)
    {
        numberClass = value;
    }

private:
    template <typename Signature>
    static std::string NameOf(std::string name)
    {
        Parameters<Signature>::AppendTo(name);
        return name;
    }

    template <typename Body>
    class CallOf final : public Call
    {
    public:
        explicit CallOf(Body callable) : body(callable) {}

        void operator()(Source& in, Sink& out) const override
        {
            body(in, out);
        }

    private:
        Body body;
    };

    /// A call with its arguments drawn: a constructor, since braces keep the order of the draws.
    template <typename Callee>
    struct Invocation
    {
        template <typename... Holders>
        Invocation(Callee callee, Sink& out, Holders... held)
        {
            try {
                if constexpr (std::is_void_v<decltype(Invoke(callee, held.Argument()...))>)
                    Invoke(callee, held.Argument()...);
                else
                    out.Put(Invoke(callee, held.Argument()...));
            } catch (const std::length_error&) {
                out.LengthError();
            }
            (held.Report(out), ...);
        }

        template <typename... Arguments>
        static decltype(auto) Invoke(Callee callee, Arguments&&... arguments)
        {
            if constexpr (std::is_member_pointer_v<Callee>)
                return InvokeMember(callee, arguments...);
            else
                return callee(arguments...);
        }

        template <typename Object, typename... Arguments>
        static decltype(auto) InvokeMember(Callee member, Object& object, Arguments&&... arguments)
        {
            return (object.*member)(arguments...);
        }
    };

    template <typename Signature, typename Callee, typename... Draws>
    void AddDrawn(const char* name, Callee callee, Draws... draws)
    {
        AddBody(NameOf<Signature>(name), [=](Source& in, Sink& out) {
            [[maybe_unused]] Draft draft{in};
            Invocation<Callee>{callee, out, draws(draft)...};
        });
    }

    void Append(std::string name, std::unique_ptr<const Call> call);

    std::vector<Function>& list;
    const char* family;
    NumberClass numberClass = NumberClass::Arithmetic;
};

/// @name The headers
/// @{
void AddBezier(std::vector<Function>& list);
void AddBezierSearches(std::vector<Function>& list);
void AddBezierOffset(std::vector<Function>& list);
void AddBezierToLines(std::vector<Function>& list);
void AddBounds(std::vector<Function>& list);
void AddCircle(std::vector<Function>& list);
void AddFitBezier(std::vector<Function>& list);
void AddFitLine(std::vector<Function>& list);
void AddLayout(std::vector<Function>& list);
void AddLine(std::vector<Function>& list);
void AddNumeric(std::vector<Function>& list);
void AddQuaternion(std::vector<Function>& list);
void AddRandom(std::vector<Function>& list);
void AddTridiagonalMatrix(std::vector<Function>& list);
void AddVectorField(std::vector<Function>& list);
void AddWMath(std::vector<Function>& list);
void AddWMathAngles(std::vector<Function>& list);
void AddWMath3D(std::vector<Function>& list);
/// @}

} // namespace ZarnMath::Catalogue
