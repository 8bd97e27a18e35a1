#include "output_html.h"

#include "measurement.h"

std::string as_html(std::string_view)
{
    throw RequestError{"--format html: this program was built without the page"};
}
