# Makes the two folders that bench_catalogue lists, once, on the Linux file system (Wine reaches
# them through Z:). Run as a script: cmake -P CatalogueBenchFolders.cmake
# Creating 100,000 files through Wine takes far too long (every new name makes it search the
# folder for a name that differs only in case), so they are made here, natively.
#   /tmp/lumvex-bench-100k      100,000 entries, one in ten a drawing
#   /tmp/lumvex-bench-100k-dwg  100,000 drawings
# A file "<folder>.complete" beside each says that the folder was finished.

function(make_bench_folder folder drawing_every)
  if(EXISTS "${folder}.complete")
    return()
  endif()
  message(STATUS "Creating 100000 entries in ${folder}")
  file(REMOVE_RECURSE "${folder}")
  file(MAKE_DIRECTORY "${folder}")
  set(others note photo sheet plan)
  set(other_extensions txt jpg xlsx pdf)
  set(batch "")
  foreach(i RANGE 0 99999)
    math(EXPR number "${i} + 100000")
    math(EXPR drawing "${i} % ${drawing_every}")
    if(drawing EQUAL 0)
      math(EXPR letter "97 + ${i} % 26")
      string(ASCII ${letter} letter)
      math(EXPR upper "${i} % 3")
      if(upper EQUAL 0)
        string(TOUPPER "${letter}" letter)
        list(APPEND batch "${folder}/Plan-${number}-Rev ${letter}.DWG")
      else()
        list(APPEND batch "${folder}/plan-${number}-rev ${letter}.dwg")
      endif()
    else()
      math(EXPR kind "${i} % 4")
      list(GET others ${kind} stem)
      list(GET other_extensions ${kind} extension)
      list(APPEND batch "${folder}/${stem}-${number}.${extension}")
    endif()
    math(EXPR batch_end "${i} % 1000")
    if(batch_end EQUAL 999)
      file(TOUCH ${batch})
      set(batch "")
    endif()
  endforeach()
  file(TOUCH "${folder}.complete")
endfunction()

make_bench_folder(/tmp/lumvex-bench-100k 10)
make_bench_folder(/tmp/lumvex-bench-100k-dwg 1)
