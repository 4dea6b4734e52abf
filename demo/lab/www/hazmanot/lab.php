<?php
// What the lab's scripts share. A name comes over the wire and is never trusted as a path: it names one entry of one folder
// or nothing. Names are bytes of Windows-1255.
function uploads_folder(): string
{
    return $_SERVER['LAB_FOLDER'] . '/uploads';
}

// The name as it stands, or null for one that could lead elsewhere.
function safe_name($name): ?string
{
    if (!is_string($name) || $name === '' || strlen($name) > 200 || $name[0] === '.') {
        return null;
    }
    return preg_match('/[\/\\\\\x00-\x1f]/', $name) ? null : $name;
}

// The names in an order's folder, sorted, without the lists themselves and half-written files.
function order_files(string $folder): array
{
    $names = [];
    foreach (scandir($folder) as $name) {
        if (is_file("$folder/$name") && $name[0] !== '.' && !preg_match('/^filelist(hom)?\d?\.txt$/', $name)) {
            $names[] = $name;
        }
    }
    return $names;
}

// An order's folder as a list: its own name, the files, how many; parted by "~~". Null when there is no such folder.
function order_list($tik): ?string
{
    $name = safe_name($tik);
    if ($name === null || !is_dir(uploads_folder() . "/$name")) {
        return null;
    }
    $files = order_files(uploads_folder() . "/$name");
    return implode('~~', array_merge([$name], $files, ['total:' . count($files)]));
}

// Whole or not at all.
function write_whole(string $path, string $text): void
{
    $passing = dirname($path) . '/.' . basename($path) . '.' . getmypid();
    if (file_put_contents($passing, $text) === strlen($text)) {
        rename($passing, $path);
    } else {
        @unlink($passing);
    }
}
