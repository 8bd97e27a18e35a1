// Measures a solid and a tint of a measurement file, from Rust, on what bindgen makes of both headers:
// measure FILE PAPER SOLID TINT.

use std::ffi::{CStr, CString};
use std::ptr::{null, null_mut};

#[allow(non_camel_case_types, non_snake_case, non_upper_case_globals, dead_code)]
mod vantrel {
    include!("vantrel.rs");
}
use vantrel::*;

const BANDS: usize = VANTREL_BANDS as usize;
const STATUS: i32 = 1; // E_STATUS

struct Sheet {
    sheet: *mut VantrelSheet,
    spectra: Vec<f64>,
}

impl Sheet {
    fn open(path: &str) -> Result<Sheet, String> {
        let bytes = std::fs::read(path).map_err(|error| error.to_string())?;
        let name = CString::new(path).unwrap();
        let mut sheet = null_mut();
        unsafe {
            let answer = vantrel_open(name.as_ptr(), bytes.as_ptr().cast(), bytes.len() as _, null(),
                                      &mut sheet, None, null_mut());
            let said = CStr::from_ptr(vantrel_answer_text(answer)).to_string_lossy().into_owned();
            let ok = vantrel_answer_ok(answer) != 0;
            vantrel_answer_free(answer);
            if !ok {
                return Err(said);
            }
            let mut spectra = vec![0.0; vantrel_patches(sheet) as usize * BANDS];
            let read = vantrel_spectra(sheet, spectra.as_mut_ptr()) != 0;
            let opened = Sheet { sheet, spectra };
            if read { Ok(opened) } else { Err(format!("{path}: no spectra")) }
        }
    }

    fn patch(&self, name: &str) -> Result<&[f64], String> {
        self.spectra.chunks(BANDS).enumerate()
            .find(|(i, _)| unsafe {
                CStr::from_ptr(vantrel_patch_name(self.sheet, *i as _)).to_bytes() == name.as_bytes()
            })
            .map(|(_, refl)| refl).ok_or(format!("no patch {name}"))
    }
}

impl Drop for Sheet {
    fn drop(&mut self) {
        unsafe { vantrel_close(self.sheet) }
    }
}

fn main() -> Result<(), String> {
    let words: Vec<String> = std::env::args().skip(1).collect();
    let sheet = Sheet::open(&words[0])?;
    let (paper, solid, tint) = (sheet.patch(&words[1])?, sheet.patch(&words[2])?, sheet.patch(&words[3])?);
    let nominal = words[3].rsplit(' ').next().unwrap().parse().map_err(|_| "no nominal value")?;
    let (mut of_solid, mut of_tint, mut gain) = (0.0, 0.0, 0.0);
    let measured = unsafe {
        let response = DetermineDensityResponse(solid.as_ptr(), STATUS, paper.as_ptr());
        ReflToDensity(solid.as_ptr(), paper.as_ptr(), STATUS, response, &mut of_solid) != 0
            && ReflToDensity(tint.as_ptr(), paper.as_ptr(), STATUS, response, &mut of_tint) != 0
            && ReflToDotGain(solid.as_ptr(), tint.as_ptr(), paper.as_ptr(), STATUS, response, 1.0,
                             nominal, &mut gain) != 0
    };
    if !measured {
        return Err("cannot be measured".into());
    }
    println!("{}: density {of_solid:.3}\n{}: density {of_tint:.3}, dot gain {gain:.2}", words[2], words[3]);
    Ok(())
}
