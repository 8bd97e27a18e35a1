// Measures a solid and a tint of a measurement file, from Go by cgo: go run measure.go FILE PAPER SOLID
// TINT, with the flags of pkg-config vantrel vantrel_sheets.
package main

/*
#cgo pkg-config: vantrel vantrel_sheets
#include <stdlib.h>
#include <vantrel.h>
#include <vantrel_sheets.h>
*/
import "C"

import (
	"fmt"
	"log"
	"os"
	"strconv"
	"strings"
	"unsafe"
)

const status = C.E_STATUS

// Every patch of a file by its name.
func read(path string) map[string][]C.double {
	bytes, err := os.ReadFile(path)
	if err != nil {
		log.Fatal(err)
	}
	name, data := C.CString(path), C.CBytes(bytes)
	defer C.free(unsafe.Pointer(name))
	defer C.free(data)
	var sheet *C.VantrelSheet
	answer := C.vantrel_open(name, (*C.char)(data), C.size_t(len(bytes)), nil, &sheet, nil, nil)
	defer C.vantrel_answer_free(answer)
	if C.vantrel_answer_ok(answer) == 0 {
		log.Fatal(C.GoString(C.vantrel_answer_text(answer)))
	}
	defer C.vantrel_close(sheet)
	patches := int(C.vantrel_patches(sheet))
	spectra := make([]C.double, patches*C.VANTREL_BANDS)
	if C.vantrel_spectra(sheet, &spectra[0]) == 0 {
		log.Fatal(path, ": no spectra")
	}
	found := make(map[string][]C.double)
	for i := 0; i < patches; i++ {
		found[C.GoString(C.vantrel_patch_name(sheet, C.size_t(i)))] = spectra[i*C.VANTREL_BANDS:]
	}
	return found
}

func main() {
	patches := read(os.Args[1])
	var spectra [3]*C.double
	for i, name := range os.Args[2:5] {
		if patches[name] == nil {
			log.Fatal("no patch ", name)
		}
		spectra[i] = &patches[name][0]
	}
	paper, solid, tint := spectra[0], spectra[1], spectra[2]
	nominal, err := strconv.Atoi(os.Args[4][strings.LastIndex(os.Args[4], " ")+1:])
	if err != nil {
		log.Fatal(err)
	}
	response := C.DetermineDensityResponse(solid, status, paper)
	var ofSolid, ofTint, gain C.double
	if C.ReflToDensity(solid, paper, status, response, &ofSolid) == 0 ||
		C.ReflToDensity(tint, paper, status, response, &ofTint) == 0 ||
		C.ReflToDotGain(solid, tint, paper, status, response, 1, C.int(nominal), &gain) == 0 {
		log.Fatal("cannot be measured")
	}
	fmt.Printf("%s: density %.3f\n%s: density %.3f, dot gain %.2f\n", os.Args[3], ofSolid, os.Args[4],
		ofTint, gain)
}
