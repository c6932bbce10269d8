// Every exported member of a family, from the generated manifest, with a typed
// call for the argument shapes of the arithmetic tables: two images (TWO*),
// a constant (C1*, CK*), a rounding mode (RND*) and one image (UN*), each
// plain or in place (_I), with or without a scale factor (_SFS).
#pragma once

#include <cstring>
#include <string>
#include <vector>

#include "harness.h"

namespace pvxtest {

struct Member {
    const char* name;
    const char* table;
    const char* group;
    const char* type;
    const char* layout;
    const char* sig;
    void (*fn)();

    std::string Sig() const { return sig; }
    bool InPlace() const { return Sig().find("_I") != std::string::npos; }
    bool Sfs() const { return Sig().find("SFS") != std::string::npos; }
    bool TwoImages() const { return Sig().rfind("TWO", 0) == 0 || Sig().rfind("RND", 0) == 0; }
    bool Const() const { return Sig()[0] == 'C'; }
    bool Unary() const { return Sig().rfind("UN", 0) == 0; }
    bool Rounding() const { return Sig().rfind("RND", 0) == 0; }
    int Channels() const
    {
        std::string l = layout;
        return l == "C1" ? 1 : l == "C3" ? 3 : 4;
    }
    bool Alpha() const { return std::string(layout) == "AC4"; }
    int Processed() const { return Alpha() ? 3 : Channels(); }
};

inline const std::vector<Member>& AllMembers()
{
    static const std::vector<Member> all = {
#define PVX_MANIFEST(name, table, group, type, layout, sig, ret, pointers) \
    {#name, table, group, type, layout, #sig, reinterpret_cast<void (*)()>(&name)},
#include "gen/manifest.inc"
#undef PVX_MANIFEST
    };
    return all;
}

inline std::vector<Member> Members(const std::string& group)
{
    std::vector<Member> out;
    for (const Member& m : AllMembers())
        if (group == m.group) out.push_back(m);
    return out;
}

// Calls f(T{}) for the pixel type T among Ts whose code is t.
template <class... Ts, class F>
void ForTypes(const std::string& t, F&& f)
{
    bool done = ((t == TypeName<Ts>() ? (f(Ts{}), true) : false) || ...);
    if (!done) ADD_FAILURE() << "type " << t;
}

// Every pixel type of the arithmetic tables.
template <class F>
void ForTypeCode(const std::string& t, F&& f)
{
    ForTypes<Pvx8u, Pvx16u, Pvx16s, Pvx32s, Pvx32f, Pvx16sc, Pvx32sc, Pvx32fc>(t, f);
}

// The arguments of one call. Two images: a is src1, b src2, d the destination;
// in place, b is the in-place image (a the source). Constant and one-image
// forms: a is the source, d the destination; in place, a is the in-place image.
template <class T>
struct CallArgs {
    const T* a = nullptr;
    int aStep = 0;
    const T* b = nullptr;
    int bStep = 0;
    T* d = nullptr;
    int dStep = 0;
    PvxiSize roi{0, 0};
    const T* value = nullptr;  // C1 forms pass value[0]
    int mode = 1;
    int sf = 0;
};

// Arguments that address the images a, b (null for one-image forms) and d
// over roi.
template <class T>
CallArgs<T> ArgsOver(GuardedImage& a, GuardedImage* b, GuardedImage& d, PvxiSize roi)
{
    CallArgs<T> x;
    x.a = a.ptr<T>();
    x.aStep = a.step();
    if (b) {
        x.b = b->ptr<T>();
        x.bStep = b->step();
    }
    x.d = d.ptr<T>();
    x.dStep = d.step();
    x.roi = roi;
    return x;
}

template <class T>
PvxStatus Invoke(const Member& m, const CallArgs<T>& x)
{
    using P = const T*;
    using S = PvxiSize;
    T* ip = const_cast<T*>(m.TwoImages() ? x.b : x.a);  // in-place image
    int is = m.TwoImages() ? x.bStep : x.aStep;
    std::string s = m.sig;
    T v1{};
    if (x.value) v1 = x.value[0];
    auto fn = m.fn;
    if (s == "TWO_SFS") return reinterpret_cast<PvxStatus (*)(P, int, P, int, T*, int, S, int)>(fn)(x.a, x.aStep, x.b, x.bStep, x.d, x.dStep, x.roi, x.sf);
    if (s == "TWO") return reinterpret_cast<PvxStatus (*)(P, int, P, int, T*, int, S)>(fn)(x.a, x.aStep, x.b, x.bStep, x.d, x.dStep, x.roi);
    if (s == "TWO_I_SFS") return reinterpret_cast<PvxStatus (*)(P, int, T*, int, S, int)>(fn)(x.a, x.aStep, ip, is, x.roi, x.sf);
    if (s == "TWO_I") return reinterpret_cast<PvxStatus (*)(P, int, T*, int, S)>(fn)(x.a, x.aStep, ip, is, x.roi);
    if (s == "RND_SFS") return reinterpret_cast<PvxStatus (*)(P, int, P, int, T*, int, S, int, int)>(fn)(x.a, x.aStep, x.b, x.bStep, x.d, x.dStep, x.roi, x.mode, x.sf);
    if (s == "RND_I_SFS") return reinterpret_cast<PvxStatus (*)(P, int, T*, int, S, int, int)>(fn)(x.a, x.aStep, ip, is, x.roi, x.mode, x.sf);
    if (s == "C1_SFS") return reinterpret_cast<PvxStatus (*)(P, int, T, T*, int, S, int)>(fn)(x.a, x.aStep, v1, x.d, x.dStep, x.roi, x.sf);
    if (s == "C1") return reinterpret_cast<PvxStatus (*)(P, int, T, T*, int, S)>(fn)(x.a, x.aStep, v1, x.d, x.dStep, x.roi);
    if (s == "CK_SFS") return reinterpret_cast<PvxStatus (*)(P, int, P, T*, int, S, int)>(fn)(x.a, x.aStep, x.value, x.d, x.dStep, x.roi, x.sf);
    if (s == "CK") return reinterpret_cast<PvxStatus (*)(P, int, P, T*, int, S)>(fn)(x.a, x.aStep, x.value, x.d, x.dStep, x.roi);
    if (s == "C1_I_SFS") return reinterpret_cast<PvxStatus (*)(T, T*, int, S, int)>(fn)(v1, ip, is, x.roi, x.sf);
    if (s == "C1_I") return reinterpret_cast<PvxStatus (*)(T, T*, int, S)>(fn)(v1, ip, is, x.roi);
    if (s == "CK_I_SFS") return reinterpret_cast<PvxStatus (*)(P, T*, int, S, int)>(fn)(x.value, ip, is, x.roi, x.sf);
    if (s == "CK_I") return reinterpret_cast<PvxStatus (*)(P, T*, int, S)>(fn)(x.value, ip, is, x.roi);
    if (s == "UN_SFS") return reinterpret_cast<PvxStatus (*)(P, int, T*, int, S, int)>(fn)(x.a, x.aStep, x.d, x.dStep, x.roi, x.sf);
    if (s == "UN") return reinterpret_cast<PvxStatus (*)(P, int, T*, int, S)>(fn)(x.a, x.aStep, x.d, x.dStep, x.roi);
    if (s == "UN_I_SFS") return reinterpret_cast<PvxStatus (*)(T*, int, S, int)>(fn)(ip, is, x.roi, x.sf);
    if (s == "UN_I") return reinterpret_cast<PvxStatus (*)(T*, int, S)>(fn)(ip, is, x.roi);
    ADD_FAILURE() << "signature " << s;
    return -12345;
}

// ---- a generic element-wise check ---------------------------------------------------

// Checks one member on one shape against ref(a, b, channel) -> T, where a and b
// are the pixel elements of the first and second operand (b: src2, or the
// constant's channel; unused for one image). want is the expected status.
// rel > 0 compares floats within rel |want| (plus the smallest subnormal).
// The in-place image starts with the operand that it replaces; AC4 alpha and
// every guard byte must stay as they were.
template <class T, class Ref>
void CheckMember(const Member& m, Shape s, Rng& rng, int sf, int mode, const std::vector<T>& value, Ref ref,
                 PvxStatus (*status)(const Member&, const std::vector<T>&, const std::vector<T>&, int) = nullptr,
                 double rel = 0)
{
    using E = ElemT<T>;
    constexpr int kP = Elem<T>::kParts;
    const int C = m.Channels();
    GuardedImage a = MakeImage<T>(s.width, s.height, C, rng);
    GuardedImage b = MakeImage<T>(s.width, s.height, C, rng);
    GuardedImage d = MakeImage<T>(s.width, s.height, C, rng);
    auto pa = a.Packed<E>(), pb = b.Packed<E>(), pd = d.Packed<E>();
    auto unit = [&](const std::vector<E>& v, std::size_t i) {
        T t;
        std::memcpy(&t, &v[i * kP], sizeof(T));
        return t;
    };
    const std::size_t units = pa.size() / kP;
    std::vector<T> ua(units), ub(units);
    for (std::size_t i = 0; i < units; ++i) {
        ua[i] = unit(pa, i);
        ub[i] = unit(pb, i);
    }
    // The image that receives the result, and its initial content.
    GuardedImage* out = m.InPlace() ? (m.TwoImages() ? &b : &a) : &d;
    std::vector<E> want = out->Packed<E>();
    for (std::size_t i = 0; i < units; ++i) {
        int ch = static_cast<int>(i % C);
        if (m.Alpha() && ch == 3) continue;
        T second = m.Const() ? value[ch] : ub[i];
        T r = ref(ua[i], second, ch);
        std::memcpy(&want[i * kP], &r, sizeof(T));
    }
    CallArgs<T> x = ArgsOver<T>(a, &b, d, {s.width, s.height});
    // The constant in a block of exactly the processed channels (three for
    // AC4): a read of a fourth shows under AddressSanitizer.
    std::vector<T> exact(value.begin(), value.begin() + (m.Alpha() ? 3 : C));
    x.value = exact.data();
    x.mode = mode;
    x.sf = sf;
    PvxStatus st = Invoke<T>(m, x);
    PvxStatus wantSt = status ? status(m, ua, ub, C) : pvxStsNoErr;
    EXPECT_EQ(st, wantSt) << m.name << " sf " << sf;
    if (rel > 0) {
        EXPECT_TRUE(RegionNear(*out, want, rel, 0x1p-149)) << m.name;
    } else {
        EXPECT_TRUE(RegionEquals(*out, want)) << m.name << " sf " << sf << " mode " << mode;
    }
    if (out != &a) {
        EXPECT_TRUE(a.Unchanged()) << m.name;
    }
    if (out != &b) {
        EXPECT_TRUE(b.Unchanged()) << m.name;
    }
    if (out != &d) {
        EXPECT_TRUE(d.Unchanged()) << m.name;
    }
    (void)pd;
}

// ---- check orders ---------------------------------------------------------------------

// Null pointers (-8), sizes (-6) and steps (-14) in the member's order, nothing
// written; kStepsFirst: steps are checked before sizes.
template <class T>
void CheckOrder(const Member& m, bool stepsFirst, const std::vector<T>& value)
{
    Rng rng = MakeRng(77);
    const int C = m.Channels();
    GuardedImage a = MakeImage<T>(8, 3, C, rng), b = MakeImage<T>(8, 3, C, rng), d = MakeImage<T>(8, 3, C, rng);
    CallArgs<T> ok = ArgsOver<T>(a, &b, d, {8, 3});
    ok.value = value.data();
    auto none = [&](PvxStatus st, PvxStatus want) { return NothingWritten(st, want, a, b, d); };
    SCOPED_TRACE(m.name);
    // pointers, each alone, even with a bad size and step
    {
        CallArgs<T> x = ok;
        x.roi = {0, 0};
        x.aStep = x.bStep = x.dStep = 0;
        CallArgs<T> y = x;
        y.a = nullptr;
        if (!m.TwoImages() && m.InPlace()) y.a = nullptr;
        EXPECT_TRUE(none(Invoke<T>(m, y), pvxStsNullPtrErr));
        if (m.TwoImages()) {
            y = x;
            y.b = nullptr;
            EXPECT_TRUE(none(Invoke<T>(m, y), pvxStsNullPtrErr));
        }
        if (!m.InPlace()) {
            y = x;
            y.d = nullptr;
            EXPECT_TRUE(none(Invoke<T>(m, y), pvxStsNullPtrErr));
        }
        if (m.Const() && m.Sig().rfind("CK", 0) == 0) {
            y = x;
            y.value = nullptr;
            EXPECT_TRUE(none(Invoke<T>(m, y), pvxStsNullPtrErr));
        }
    }
    // sizes and steps
    for (PvxiSize bad : {PvxiSize{0, 3}, PvxiSize{8, 0}, PvxiSize{-1, 3}}) {
        CallArgs<T> x = ok;
        x.roi = bad;
        EXPECT_TRUE(none(Invoke<T>(m, x), pvxStsSizeErr));
        x.aStep = 0;
        EXPECT_TRUE(none(Invoke<T>(m, x), stepsFirst ? pvxStsStepErr : pvxStsSizeErr));
    }
    for (int which = 0; which < 3; ++which) {
        CallArgs<T> x = ok;
        if (which == 0) x.aStep = 0;
        if (which == 1) {
            if (!m.TwoImages()) continue;
            x.bStep = -x.bStep;
        }
        if (which == 2) {
            if (m.InPlace()) continue;
            x.dStep = 0;
        }
        EXPECT_TRUE(none(Invoke<T>(m, x), pvxStsStepErr)) << "step " << which;
    }
}

}  // namespace pvxtest
