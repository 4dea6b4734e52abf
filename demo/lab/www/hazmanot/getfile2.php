<?php
// Takes the file of a request into the folder of its order.
require __DIR__ . '/lab.php';
header('Content-Type: text/plain; charset=windows-1255');
umask(077);
$folder = safe_name($_GET['folder'] ?? null);
$file = $_FILES['uploadedFile'] ?? null;
$name = is_array($file) ? safe_name($file['name']) : null;
if ($folder === null || $name === null) {
    http_response_code(400);
    exit("no folder or no file\r\n");
}
if ($file['error'] !== UPLOAD_ERR_OK) {
    http_response_code(500);
    exit('error ' . $file['error'] . "\r\n");
}
$target = uploads_folder() . "/$folder";
if (!is_dir($target)) {
    @mkdir($target, 0700, true);
}
if (!move_uploaded_file($file['tmp_name'], "$target/$name")) {
    http_response_code(500);
    exit("error: can't store\r\n");
}
echo "stored\r\n";
