<?php
// Writes the list of an order's folder into that folder, under the names by which it is fetched.
require __DIR__ . '/lab.php';
header('Content-Type: text/plain; charset=windows-1255');
umask(077);
$tik = $_GET['tik'] ?? null;
$list = order_list($tik);
if ($list === null) {
    exit('folder not found');
}
foreach (['filelisthom.txt', 'filelisthom1.txt', 'filelisthom2.txt', 'filelisthom3.txt', 'filelist1.txt'] as $name) {
    write_whole(uploads_folder() . "/$tik/$name", $list);
}
echo 'ok';
