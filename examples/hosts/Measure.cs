// Measures a solid and a tint of a measurement file, from C#: mcs Measure.cs && mono Measure.exe FILE
// PAPER SOLID TINT. Both libraries are found by the system's loader.

using System;
using System.Globalization;
using System.IO;
using System.Runtime.InteropServices;
using System.Text;

static class Vantrel
{
    public const int Bands = 31, EStatus = 1, NumResponses = 9;

    [DllImport("Vantrel")]
    public static extern int DetermineDensityResponse(double[] refl, int status, double[] paper);
    [DllImport("Vantrel")]
    public static extern int ReflToDensity(double[] refl, double[] paper, int status, int response,
                                           out double density);
    [DllImport("Vantrel")]
    public static extern int ReflToDotGain(double[] solid, double[] tint, double[] paper, int status,
                                           int response, double nFactor, int nominal, out double gain);
}

sealed class Sheet : IDisposable
{
    [DllImport("VantrelSheets")]
    static extern IntPtr vantrel_open(byte[] name, byte[] bytes, UIntPtr size, byte[] options,
                                      out IntPtr sheet, IntPtr tell, IntPtr user);
    [DllImport("VantrelSheets")] static extern void vantrel_close(IntPtr sheet);
    [DllImport("VantrelSheets")] static extern UIntPtr vantrel_patches(IntPtr sheet);
    [DllImport("VantrelSheets")] static extern int vantrel_spectra(IntPtr sheet, double[] spectra);
    [DllImport("VantrelSheets")] static extern IntPtr vantrel_patch_name(IntPtr sheet, UIntPtr patch);
    [DllImport("VantrelSheets")] static extern int vantrel_answer_ok(IntPtr answer);
    [DllImport("VantrelSheets")] static extern IntPtr vantrel_answer_text(IntPtr answer);
    [DllImport("VantrelSheets")] static extern void vantrel_answer_free(IntPtr answer);

    readonly IntPtr sheet;
    readonly double[] spectra;

    // Texts are UTF-8 with a zero behind them.
    static byte[] Utf8(string text) { return Encoding.UTF8.GetBytes(text + "\0"); }
    static string Text(IntPtr utf8)
    {
        int size = 0;
        while (Marshal.ReadByte(utf8, size) != 0) ++size;
        var bytes = new byte[size];
        Marshal.Copy(utf8, bytes, 0, size);
        return Encoding.UTF8.GetString(bytes);
    }

    public Sheet(string path)
    {
        byte[] bytes = File.ReadAllBytes(path);
        IntPtr answer = vantrel_open(Utf8(path), bytes, (UIntPtr)bytes.Length, null, out sheet,
                                     IntPtr.Zero, IntPtr.Zero);
        string said = Text(vantrel_answer_text(answer));
        bool ok = vantrel_answer_ok(answer) != 0;
        vantrel_answer_free(answer);
        if (!ok) throw new InvalidDataException(said);
        spectra = new double[(int)vantrel_patches(sheet) * Vantrel.Bands];
        if (vantrel_spectra(sheet, spectra) == 0) throw new InvalidDataException(path + ": no spectra");
    }

    public void Dispose() { vantrel_close(sheet); }

    public double[] this[string name]
    {
        get
        {
            for (int i = 0; i * Vantrel.Bands < spectra.Length; ++i)
                if (Text(vantrel_patch_name(sheet, (UIntPtr)i)) == name)
                {
                    var refl = new double[Vantrel.Bands];
                    Array.Copy(spectra, i * Vantrel.Bands, refl, 0, Vantrel.Bands);
                    return refl;
                }
            throw new ArgumentException("no patch " + name);
        }
    }
}

static class Measure
{
    static void Main(string[] words)
    {
        using (var sheet = new Sheet(words[0]))
        {
            double[] paper = sheet[words[1]], solid = sheet[words[2]], tint = sheet[words[3]];
            int nominal = int.Parse(words[3].Substring(words[3].LastIndexOf(' ') + 1));
            int response = Vantrel.DetermineDensityResponse(solid, Vantrel.EStatus, paper);
            double ofSolid, ofTint, gain;
            if (response == Vantrel.NumResponses ||
                Vantrel.ReflToDensity(solid, paper, Vantrel.EStatus, response, out ofSolid) == 0 ||
                Vantrel.ReflToDensity(tint, paper, Vantrel.EStatus, response, out ofTint) == 0 ||
                Vantrel.ReflToDotGain(solid, tint, paper, Vantrel.EStatus, response, 1, nominal,
                                      out gain) == 0)
                throw new InvalidOperationException("cannot be measured");
            Console.WriteLine(string.Format(CultureInfo.InvariantCulture,
                "{0}: density {1:F3}\n{2}: density {3:F3}, dot gain {4:F2}", words[2], ofSolid,
                words[3], ofTint, gain));
        }
    }
}
